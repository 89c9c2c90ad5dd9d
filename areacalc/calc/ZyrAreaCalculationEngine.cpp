#include "areacalc/calc/ZyrAreaCalculationEngine.h"

#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationBitmapCreator.h"
#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/modifiers/ZyrDbAreaModifier.h"
#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "platform/host/db/HsDbEntity.h"
#include "platform/host/rx/HsRxClass.h"

#include <algorithm>
#include <cwchar>

namespace {

// Closes an object opened for read when the scope ends, however it ends.
class ReadOpen {
public:
    explicit ReadOpen(HsDbObject* object) : m_object(object) {}
    ReadOpen(const ReadOpen&) = delete;
    ReadOpen& operator=(const ReadOpen&) = delete;
    ~ReadOpen() {
        if (m_object != nullptr)
            (void)m_object->close();
    }

private:
    HsDbObject* m_object;
};

HsDbEntity* openEntityForRead(const HsDbObjectId& id, Hsys::ErrorStatus& status) {
    HsDbObject* object = nullptr;
    status = hsdbOpenObject(object, id, HsDb::kForRead, false);
    if (status != Hsys::eSuccess || object == nullptr)
        return nullptr;
    if (auto* entity = HsDbEntity::cast(object))
        return entity;
    // Only entities are calculated; anything else is closed again and left out.
    (void)object->close();
    return nullptr;
}

} // namespace

bool ZyrACFunctional::lessPairSecond(const NamedId& first, const NamedId& second) {
    return std::wcscmp(first.second.GetString(), second.second.GetString()) < 0;
}

void ZyrACFunctional::sortByName(std::vector<NamedId>& named) {
    // Members are often kept in the order of their names; then one look over them is enough.
    if (!std::is_sorted(named.begin(), named.end(), lessPairSecond))
        std::sort(named.begin(), named.end(), lessPairSecond);
}

template <class T> void ZyrACFunctional::sortNamedObjects(std::vector<HsDbObjectId>& ids, T*) {
    std::vector<NamedId> named;
    named.reserve(ids.size());
    for (const HsDbObjectId& id : ids) {
        T* object = nullptr;
        if (T::open(object, id, HsDb::kForRead, false) != Hsys::eSuccess)
            continue;
        named.emplace_back(id, object->name());
        (void)object->close();
    }
    sortByName(named);
    ids.clear();
    for (const NamedId& entry : named)
        ids.push_back(entry.first);
}

template void ZyrACFunctional::sortNamedObjects<ZyrDbArea>(std::vector<HsDbObjectId>&, ZyrDbArea*);
template void ZyrACFunctional::sortNamedObjects<ZyrDbAreaGroup>(std::vector<HsDbObjectId>&,
                                                                ZyrDbAreaGroup*);

ZyrAreaCalculationEngine::ZyrAreaCalculationEngine()
    : algorithmsBegin(algorithms.begin()), algorithmsEnd(algorithms.end()),
      currentAlgorithm(algorithms.begin()) {
    pushFunctions[ZyrDbArea::desc()] = &ZyrAreaCalculationEngine::pushArea;
    pushFunctions[ZyrDbAreaGroup::desc()] = &ZyrAreaCalculationEngine::pushGroup;
    pushFunctions[HsDbEntity::desc()] = &ZyrAreaCalculationEngine::pushHsDbEntity;
}

ZyrAreaCalculationEngine::~ZyrAreaCalculationEngine() {
    delete bitmapCreator;
}

Hsys::ErrorStatus ZyrAreaCalculationEngine::calculate(const std::vector<HsDbObjectId>& ids,
                                                      ZyrAreaCalculationStream* target,
                                                      PostfixCallback callback,
                                                      void* callbackData) {
    // Whatever way the call ends, no modifier opened on the way stays open.
    struct CloseModifiersOnExit {
        ZyrAreaCalculationEngine& engine;
        ~CloseModifiersOnExit() { engine.closeModifiers(); }
    } closeOnExit{*this};

    if (target == nullptr)
        return Hsys::eNullPointer;
    if (ids.empty())
        return Hsys::eSuccess;
    ZyrAreaCalculationHdxServices* services = ZyrAreaCalculationHdxServices::service();
    whiteBoard = services != nullptr ? services->whiteBoard() : nullptr;
    if (whiteBoard == nullptr)
        return Hsys::eDoesNotApply;
    const auto& attached = whiteBoard->algorithmVector();
    if (attached.empty())
        return Hsys::eBadArgument;
    if (bitmapCreator == nullptr)
        bitmapCreator = new ZyrAreaCalculationBitmapCreator(whiteBoard);
    // The display representations come with the display layer; until it has registered them
    // there is no class to make a preview for, and headers carry no bitmap. Looked up once, not
    // once per object.
    areaDispRepClass = hsrxFindHsRxClass(L"ZyrDbDispRepArea");
    groupDispRepClass = hsrxFindHsRxClass(L"ZyrDbDispRepAreaGroup");

    for (ZyrAreaCalculationAlgorithm* algorithm : attached)
        algorithms.emplace_back(algorithm, true);
    algorithmsBegin = algorithms.begin();
    algorithmsEnd = algorithms.end();
    currentAlgorithm = algorithmsBegin;

    stream = target;
    postfixCallback = callback;
    postfixCallbackData = callbackData;
    return calculateRoots(ids);
}

Hsys::ErrorStatus ZyrAreaCalculationEngine::calculateRoots(const std::vector<HsDbObjectId>& ids) {
    std::vector<HsDbObjectId> sorted = ids;
    sortInput(sorted);
    // Only the last open is reported: a caller sees whether the end of its list was reached.
    Hsys::ErrorStatus status = Hsys::eSuccess;
    for (const HsDbObjectId& id : sorted)
        status = pushRoot(id);
    return status;
}

Hsys::ErrorStatus ZyrAreaCalculationEngine::pushRoot(const HsDbObjectId& id) {
    Hsys::ErrorStatus status = Hsys::eSuccess;
    HsDbEntity* entity = openEntityForRead(id, status);
    if (entity == nullptr)
        return status;
    const ReadOpen open(entity);
    const PushFunction push = pushFunctionFor(entity->isA());
    enableAllAlgorithms();
    if (ZyrCalculationNode* node = (this->*push)(entity))
        ZyrAreaCalculationStreamWriter(*stream).appendRoot(node);
    return status;
}

ZyrAreaCalculationEngine::PushFunction
ZyrAreaCalculationEngine::pushFunctionFor(const HsRxClass* cls) const {
    // By the exact class: a class derived from an area is no area to the calculation.
    const auto found = pushFunctions.find(cls);
    return found != pushFunctions.end() ? found->second : pushFunctions.at(HsDbEntity::desc());
}

void ZyrAreaCalculationEngine::enableAllAlgorithms() {
    for (auto& entry : algorithms)
        entry.second = true;
}

ZyrCalculationNode* ZyrAreaCalculationEngine::pushArea(HsDbEntity* entity) {
    ZyrCalculationNode* node = nullptr;
    if (ZyrDbArea::cast(entity) != nullptr) {
        node = new ZyrCalculationNode;
        connectNodeHeaderToCalculationNode(entity, &ZyrAreaCalculationEngine::areaNodeHeader, node);
        // An area has no list of allowed algorithms: the groups above it decide alone.
        for (currentAlgorithm = algorithmsBegin; currentAlgorithm != algorithmsEnd;
             ++currentAlgorithm) {
            if (!currentAlgorithm->second)
                continue;
            ZyrCalculationNodeData* data = connectNodeDataToCalculationNode(
                entity, currentAlgorithm->first, &ZyrAreaCalculationAlgorithm::areaNodeData, node);
            handleModifiers(ZyrDbArea::cast(entity), currentAlgorithm->first, data);
        }
    }
    postfixPush();
    return node;
}

ZyrCalculationNode* ZyrAreaCalculationEngine::pushGroup(HsDbEntity* entity) {
    const ZyrDbAreaGroup* group = ZyrDbAreaGroup::cast(entity);
    // A group inside itself can only come from a damaged drawing; it is not entered again.
    if (group == nullptr || !groupsOnPath.insert(entity->objectId()).second) {
        postfixPush();
        return nullptr;
    }
    struct LeavePath {
        std::unordered_set<HsDbObjectId>& path;
        HsDbObjectId id;
        ~LeavePath() { path.erase(id); }
    } leavePath{groupsOnPath, entity->objectId()};
    auto* node = new ZyrCalculationNode;
    connectNodeHeaderToCalculationNode(entity, &ZyrAreaCalculationEngine::areaGroupNodeHeader,
                                       node);

    // An algorithm that the group does not allow is off for its whole subtree; one that an
    // enclosing group switched off stays off and is given back by that group alone.
    std::vector<ZyrCalculationNodeData*> groupData;
    std::vector<AlgorithmVector::iterator> disabled;
    const ZyrImpAreaGroup::Algorithms& allowed = group->algorithms();
    for (currentAlgorithm = algorithmsBegin; currentAlgorithm != algorithmsEnd;
         ++currentAlgorithm) {
        if (!currentAlgorithm->second)
            continue;
        if (allowed.contains(currentAlgorithm->first->isA())) {
            groupData.push_back(connectNodeDataToCalculationNode(
                entity, currentAlgorithm->first, &ZyrAreaCalculationAlgorithm::areaGroupNodeData,
                node));
        } else {
            currentAlgorithm->second = false;
            disabled.push_back(currentAlgorithm);
        }
    }

    std::vector<HsDbObjectId> members = group->groupHandler()->nodes();
    ZyrACFunctional::sortNamedObjects(members, static_cast<ZyrDbAreaGroup*>(nullptr));
    handleGroupChilds(members, &ZyrAreaCalculationEngine::pushGroup, node, groupData);
    members = group->groupHandler()->leafs();
    ZyrACFunctional::sortNamedObjects(members, static_cast<ZyrDbArea*>(nullptr));
    handleGroupChilds(members, &ZyrAreaCalculationEngine::pushArea, node, groupData);

    // The group's own modifiers work on the sum of its members' net values.
    auto data = groupData.begin();
    for (currentAlgorithm = algorithmsBegin; currentAlgorithm != algorithmsEnd;
         ++currentAlgorithm) {
        if (currentAlgorithm->second)
            handleModifiers(group, currentAlgorithm->first, *data++);
    }
    for (const AlgorithmVector::iterator& entry : disabled)
        entry->second = true;
    postfixPush();
    return node;
}

ZyrCalculationNode* ZyrAreaCalculationEngine::pushHsDbEntity(HsDbEntity*) {
    postfixPush();
    return nullptr;
}

void ZyrAreaCalculationEngine::postfixPush() {
    if (postfixCallback != nullptr)
        postfixCallback(postfixCallbackData);
}

void ZyrAreaCalculationEngine::sortInput(std::vector<HsDbObjectId>& ids) {
    std::vector<ZyrACFunctional::NamedId> groups;
    std::vector<ZyrACFunctional::NamedId> areas;
    for (const HsDbObjectId& id : ids) {
        Hsys::ErrorStatus status = Hsys::eSuccess;
        HsDbEntity* entity = openEntityForRead(id, status);
        if (entity == nullptr)
            continue;
        const ReadOpen open(entity);
        // Whatever is neither area nor group never reaches the calculation.
        if (const ZyrDbArea* area = ZyrDbArea::cast(entity))
            areas.emplace_back(id, area->name());
        else if (const ZyrDbAreaGroup* group = ZyrDbAreaGroup::cast(entity))
            groups.emplace_back(id, group->name());
    }
    ZyrACFunctional::sortByName(groups);
    ZyrACFunctional::sortByName(areas);
    ids.clear();
    for (const auto* list : {&groups, &areas})
        for (const auto& entry : *list)
            ids.push_back(entry.first);
}

void ZyrAreaCalculationEngine::closeModifiers() {
    // The entries stay: an engine serves one calculation.
    for (const auto& entry : modifiers)
        if (entry.second != nullptr)
            (void)entry.second->close();
}

ZyrCalculationNodeHeader*
ZyrAreaCalculationEngine::connectNodeHeaderToCalculationNode(HsDbEntity* entity, HeaderMaker maker,
                                                             ZyrCalculationNode* node) {
    int index = 0;
    if (!stream->hasNodeHeaderFor(entity->objectId(), index))
        index = ZyrAreaCalculationStreamWriter(*stream).appendNodeHeader((this->*maker)(entity));
    node->headerIndex = index;
    return stream->nodeHeaderVector()[static_cast<size_t>(index)];
}

ZyrCalculationNodeData* ZyrAreaCalculationEngine::connectNodeDataToCalculationNode(
    HsDbEntity* entity, ZyrAreaCalculationAlgorithm* algorithm, NodeDataMaker maker,
    ZyrCalculationNode* node) {
    ZyrCalculationNodeData* data = (algorithm->*maker)(entity, bitmapCreator);
    node->nodeDataIndices.push_back(ZyrAreaCalculationStreamWriter(*stream).appendNodeData(data));
    return data;
}

const ZyrRmCString& ZyrAreaCalculationEngine::className(const HsRxClass* cls) {
    for (const auto& [known, name] : classNames)
        if (known == cls)
            return name;
    return classNames.emplace_back(cls, cls->name()).second;
}

ZyrCalculationNodeHeader* ZyrAreaCalculationEngine::areaNodeHeader(HsDbEntity* entity) {
    auto* header = new ZyrCalculationNodeHeader;
    const ZyrDbArea* area = ZyrDbArea::cast(entity);
    if (area == nullptr)
        return header;
    header->className = className(entity->isA());
    header->objectId = entity->objectId();
    header->name = area->name();
    // An area keeps no description of its own: its header's stays empty.
    if (bitmapCreator != nullptr)
        header->bitmap = bitmapCreator->bitmap(entity, areaDispRepClass);
    return header;
}

ZyrCalculationNodeHeader* ZyrAreaCalculationEngine::areaGroupNodeHeader(HsDbEntity* entity) {
    auto* header = new ZyrCalculationNodeHeader;
    const ZyrDbAreaGroup* group = ZyrDbAreaGroup::cast(entity);
    if (group == nullptr)
        return header;
    header->className = className(entity->isA());
    header->objectId = entity->objectId();
    header->name = group->name();
    // A group keeps no description of its own: its header's stays empty.
    if (bitmapCreator != nullptr)
        header->bitmap = bitmapCreator->bitmap(entity, groupDispRepClass);
    return header;
}

void ZyrAreaCalculationEngine::handleGroupChilds(
    const std::vector<HsDbObjectId>& ids, PushFunction push, ZyrCalculationNode* parent,
    const std::vector<ZyrCalculationNodeData*>& parentData) {
    for (const HsDbObjectId& id : ids) {
        Hsys::ErrorStatus status = Hsys::eSuccess;
        HsDbEntity* entity = openEntityForRead(id, status);
        if (entity == nullptr)
            continue;
        ZyrCalculationNode* child = nullptr;
        {
            const ReadOpen open(entity);
            child = (this->*push)(entity);
        }
        // The members were sorted by their class, so push makes a node unless a group holds
        // itself.
        if (child == nullptr)
            continue;
        parent->children.push_back(child);
        child->parent = parent;
        foldIntoParent(*child, parentData);
    }
}

void ZyrAreaCalculationEngine::foldIntoParent(
    const ZyrCalculationNode& child, const std::vector<ZyrCalculationNodeData*>& parentData) const {
    for (int index : child.nodeDataIndices) {
        const ZyrCalculationNodeData* data = stream->nodeDataVector()[static_cast<size_t>(index)];
        // Matched by the algorithm's class name: a record of an algorithm the parent does not
        // evaluate adds nothing.
        const auto match = std::find_if(
            parentData.begin(), parentData.end(), [data](const ZyrCalculationNodeData* candidate) {
                return candidate->algorithmClassName == data->algorithmClassName;
            });
        if (match == parentData.end())
            continue;
        (*match)->grossValue += data->grossValue;
        (*match)->netValue += data->netValue;
    }
}

void ZyrAreaCalculationEngine::handleModifiers(const ZyrDbEntity* entity,
                                               ZyrAreaCalculationAlgorithm* algorithm,
                                               ZyrCalculationNodeData* data) {
    std::vector<int> indices;
    modifierDataVector(entity, algorithm, indices);
    // Without a step the net value stays as it is.
    if (indices.empty())
        return;
    double value = data->netValue;
    double after = value;
    std::wstring hardCodedName;
    ZyrDbAreaModifier::getHardCodedValueName(hardCodedName);
    // One text shared by the names of every step.
    const ZyrRmCString valueName(std::move(hardCodedName));
    for (int index : indices) {
        const ZyrModifierData* record = stream->modifierDataVector()[static_cast<size_t>(index)];
        const auto found = modifiers.find(record->objectId);
        // A failed evaluation leaves the value of the step before; the step is recorded anyway.
        if (found != modifiers.end() && found->second != nullptr)
            (void)found->second->evaluateExpr(value, after);
        ZyrModifierBlock block;
        block.modifierIndex = index;
        block.beforeName = valueName;
        block.beforeValue = value;
        block.afterName = valueName;
        block.afterValue = after;
        data->modifierBlocks.push_back(std::move(block));
        value = after;
    }
    data->netValue = after;
}

void ZyrAreaCalculationEngine::modifierDataVector(const ZyrDbEntity* entity,
                                                  ZyrAreaCalculationAlgorithm* algorithm,
                                                  std::vector<int>& indices) {
    std::vector<HsDbObjectId> ids;
    (void)ZyrDbAreaModifierOperations::modifiersFor(entity, ids);
    if (ids.empty())
        return;
    HsRxClass* algorithmClass = algorithm->isA();
    const ZyrDbAreaModifier* current = nullptr;
    for (const HsDbObjectId& id : ids) {
        current = cachedModifier(id, current);
        // Before any modifier could be opened there is nothing to apply.
        if (current == nullptr || !current->algorithms().contains(algorithmClass))
            continue;
        indices.push_back(modifierDataIndex(*current));
    }
}

const ZyrDbAreaModifier*
ZyrAreaCalculationEngine::cachedModifier(const HsDbObjectId& id,
                                         const ZyrDbAreaModifier* previous) {
    if (const auto found = modifiers.find(id); found != modifiers.end())
        return found->second;
    ZyrDbAreaModifier* opened = nullptr;
    if (ZyrDbAreaModifier::open(opened, id, HsDb::kForRead, false) != Hsys::eSuccess)
        // Deliberately the modifier before stands in for the one that did not open.
        return previous;
    modifiers.emplace(id, opened);
    return opened;
}

int ZyrAreaCalculationEngine::modifierDataIndex(const ZyrDbAreaModifier& modifier) {
    int index = 0;
    if (stream->hasModifierDataFor(modifier.objectId(), index))
        return index;
    auto* record = new ZyrModifierData;
    (void)modifier.getName(record->name);
    record->description = modifier.description();
    record->objectId = modifier.objectId();
    modifier.partialReplacedExpression(record->expression);
    return ZyrAreaCalculationStreamWriter(*stream).appendModifierData(record);
}
