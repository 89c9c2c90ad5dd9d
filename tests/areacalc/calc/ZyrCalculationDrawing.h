// A drawing with both algorithms attached to the white board, with helpers for modifiers on
// objects and one calculation into a stream.
#pragma once

#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/calc/ZyrAreaCalculationEngine.h"
#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"

#include <functional>
#include <string>
#include <vector>

class ZyrCalculationDrawing : public ZyrAreaDrawing {
protected:
    void SetUp() override {
        ZyrAreaDrawing::SetUp();
        board = ZyrAreaCalculationTestModule::services().whiteBoard();
        ASSERT_EQ(board->detachAlgorithm(nullptr), Hsys::eSuccess);
        ASSERT_EQ(board->attachAlgorithm(areaAlgorithm()), Hsys::eSuccess);
        ASSERT_EQ(board->attachAlgorithm(perimeterAlgorithm()), Hsys::eSuccess);
    }

    HsDbObjectId addRoom(const wchar_t* name, double width, double depth) {
        return addArea(name, rectangle(width, depth));
    }
    void attachModifiers(const HsDbObjectId& id, const Ids& modifiers) {
        HsDbObjectPointer<ZyrDbEntity> entity(id, HsDb::kForWrite);
        EXPECT_EQ(ZyrDbAreaModifierOperations::appendModifier(entity.object(), modifiers),
                  Hsys::eSuccess);
    }
    // A modifier of the drawing acting on the area algorithm only.
    HsDbObjectId addAreaModifier(const wchar_t* name, const wchar_t* formula) {
        const HsDbObjectId id = addModifier(name, formula);
        EXPECT_EQ(HsDbObjectPointer<ZyrDbAreaModifier>(id, HsDb::kForWrite)
                      ->removeAlgorithm(perimeterAlgorithm()),
                  Hsys::eSuccess);
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
