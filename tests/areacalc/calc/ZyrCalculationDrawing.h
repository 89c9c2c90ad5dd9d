// A drawing with the module's services running and both algorithms attached, with helpers for
// groups that allow chosen calculations, modifiers on objects, and one calculation into a stream.
#pragma once

#include "areacalc/calc/ZyrAreaCalculationEngine.h"
#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "tests/areacalc/modifiers/ZyrAreaModifierDrawing.h"

#include <functional>
#include <string>
#include <vector>

using Ids = std::vector<HsDbObjectId>;
using Classes = std::vector<HsRxClass*>;

class ZyrCalculationDrawing : public ZyrAreaModifierDrawing {
protected:
    void SetUp() override {
        ZyrAreaModifierDrawing::SetUp();
        board = ZyrAreaCalculationTestModule::services().whiteBoard();
        ASSERT_EQ(board->detachAlgorithm(nullptr), Hsys::eSuccess);
        ASSERT_EQ(board->attachAlgorithm(areaAlgorithm()), Hsys::eSuccess);
        ASSERT_EQ(board->attachAlgorithm(perimeterAlgorithm()), Hsys::eSuccess);
    }

    // A group of the drawing; every algorithm is allowed unless a list is given.
    HsDbObjectId addGroup(const wchar_t* name, const Ids& nodes, const Ids& leafs,
                          const Classes* allowed = nullptr) {
        auto* group = new ZyrDbAreaGroup;
        EXPECT_EQ(group->setName(name), Hsys::eSuccess);
        HsDbObjectId id;
        EXPECT_EQ(database.addHsDbObject(id, group), Hsys::eSuccess);
        for (const HsDbObjectId& node : nodes)
            EXPECT_EQ(group->groupHandler()->addNode(node), Hsys::eSuccess);
        for (const HsDbObjectId& leaf : leafs)
            EXPECT_EQ(group->groupHandler()->addLeaf(leaf), Hsys::eSuccess);
        if (allowed != nullptr) {
            group->algorithms().clear();
            for (HsRxClass* cls : *allowed)
                EXPECT_EQ(group->algorithms().add(cls), Hsys::eSuccess);
        }
        group->close();
        return id;
    }
    HsDbObjectId addRoom(const wchar_t* name, double width, double depth) {
        return addArea(name, rectangle(width, depth));
    }
    void attachModifiers(const HsDbObjectId& id, const Ids& modifiers) {
        HsDbObject* object = nullptr;
        ASSERT_EQ(hsdbOpenObject(object, id, HsDb::kForWrite), Hsys::eSuccess);
        EXPECT_EQ(ZyrDbAreaModifierOperations::appendModifier(ZyrDbEntity::cast(object), modifiers),
                  Hsys::eSuccess);
        object->close();
    }
    // A modifier of the drawing acting on the area algorithm only.
    HsDbObjectId addAreaModifier(const wchar_t* name, const wchar_t* formula) {
        const HsDbObjectId id = addModifier(name, formula);
        ZyrDbAreaModifier* modifier = nullptr;
        EXPECT_EQ(ZyrDbAreaModifier::open(modifier, id, HsDb::kForWrite), Hsys::eSuccess);
        EXPECT_EQ(modifier->removeAlgorithm(perimeterAlgorithm()), Hsys::eSuccess);
        modifier->close();
        return id;
    }

    // A fresh engine, as every caller makes one per calculation.
    Hsys::ErrorStatus calculate(const Ids& ids, std::function<void()> callback = {}) {
        ZyrAreaCalculationEngine engine;
        return engine.calculate(ids, &stream, &runCallback, callback ? &callback : nullptr);
    }
    static void runCallback(void* callback) {
        if (callback != nullptr)
            (*static_cast<std::function<void()>*>(callback))();
    }

    std::wstring nameOf(const ZyrCalculationNode& node) const {
        return stream.nodeHeader(node)->name.str();
    }
    std::vector<std::wstring> rootNames() const {
        std::vector<std::wstring> names;
        for (const ZyrCalculationNode* root : stream.roots())
            names.push_back(nameOf(*root));
        return names;
    }
    // The node's record of the algorithm, or null.
    ZyrCalculationNodeData* data(const ZyrCalculationNode& node, HsRxClass* algorithm) const {
        for (int i = 0; i < stream.nNodeDatas(node); ++i)
            if (stream.nodeDataAt(node, i)->algorithmClassName == algorithm->name())
                return stream.nodeDataAt(node, i);
        return nullptr;
    }
    // "name:AP" for every node in pre-order, one letter per algorithm that has data on it.
    std::vector<std::wstring> evaluatedAlgorithms() const {
        std::vector<std::wstring> lines;
        std::function<void(const ZyrCalculationNode&)> walk = [&](const ZyrCalculationNode& node) {
            std::wstring line = nameOf(node) + L":";
            for (int i = 0; i < stream.nNodeDatas(node); ++i)
                line += stream.nodeDataAt(node, i)->algorithmClassName == areaAlgorithm()->name()
                            ? L"A"
                            : L"P";
            lines.push_back(line);
            for (const ZyrCalculationNode* child : node.children)
                walk(*child);
        };
        for (const ZyrCalculationNode* root : stream.roots())
            walk(*root);
        return lines;
    }

    ZyrAreaCalculationWhiteBoard* board = nullptr;
    ZyrAreaCalculationStream stream;
};
