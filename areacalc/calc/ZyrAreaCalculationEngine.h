// Turns a list of areas and area groups into a filled calculation stream.
#pragma once

#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <map>
#include <unordered_set>
#include <utility>
#include <vector>

class HsDbEntity;
class HsRxClass;
class ZyrAreaCalculationAlgorithm;
class ZyrAreaCalculationBitmapCreator;
class ZyrAreaCalculationStream;
class ZyrAreaCalculationWhiteBoard;
class ZyrDbAreaModifier;
class ZyrDbEntity;
struct ZyrCalculationNode;
struct ZyrCalculationNodeData;
struct ZyrCalculationNodeHeader;

// The orderings of a calculation's input and of a group's members.
struct ZyrACFunctional {
    using NamedId = std::pair<HsDbObjectId, ZyrRmCString>;

    // By wide-character value: case sensitive and independent of any locale, so that a plan
    // lists the same on every machine.
    static bool lessPairSecond(const NamedId& first, const NamedId& second);
    // By lessPairSecond; equal names keep no particular order.
    static void sortByName(std::vector<NamedId>& named);
    // Keeps the ids that open as a T, sorted by name; the pointer only selects T (ZyrDbArea or
    // ZyrDbAreaGroup).
    template <class T> static void sortNamedObjects(std::vector<HsDbObjectId>& ids, T*);
};

// An engine serves one calculation: it neither forgets the algorithms of a call nor the
// modifiers it opened, so a second call would count every value twice.
class ZyrAreaCalculationEngine {
public:
    using PostfixCallback = void (*)(void*);

    ZyrAreaCalculationEngine();
    ZyrAreaCalculationEngine(const ZyrAreaCalculationEngine&) = delete;
    ZyrAreaCalculationEngine& operator=(const ZyrAreaCalculationEngine&) = delete;
    virtual ~ZyrAreaCalculationEngine();

    // Fills stream with one root per input group and area (groups first, each kind by name),
    // evaluated by every algorithm attached to the white board. eNullPointer for a null stream,
    // eDoesNotApply without services or board, eBadArgument without an attached algorithm;
    // otherwise the status of the last open of an input object, whatever the earlier ones were.
    // The callback runs after every object pushed, members before their group.
    virtual Hsys::ErrorStatus calculate(const std::vector<HsDbObjectId>& ids,
                                        ZyrAreaCalculationStream* stream, PostfixCallback callback,
                                        void* callbackData);

private:
    using PushFunction = ZyrCalculationNode* (ZyrAreaCalculationEngine::*)(HsDbEntity*);
    using HeaderMaker = ZyrCalculationNodeHeader* (ZyrAreaCalculationEngine::*)(HsDbEntity*);
    using NodeDataMaker = ZyrCalculationNodeData* (
        ZyrAreaCalculationAlgorithm::*)(HsDbEntity*, const ZyrAreaCalculationBitmapCreator*) const;
    // Each attached algorithm with whether it still runs at the current depth of the tree.
    using AlgorithmVector = std::vector<std::pair<ZyrAreaCalculationAlgorithm*, bool>>;

    Hsys::ErrorStatus calculateRoots(const std::vector<HsDbObjectId>& ids);
    Hsys::ErrorStatus pushRoot(const HsDbObjectId& id);
    PushFunction pushFunctionFor(const HsRxClass* cls) const;

    ZyrCalculationNode* pushArea(HsDbEntity* entity);
    ZyrCalculationNode* pushGroup(HsDbEntity* entity);
    ZyrCalculationNode* pushHsDbEntity(HsDbEntity* entity);
    void postfixPush();
    void sortInput(std::vector<HsDbObjectId>& ids);
    void enableAllAlgorithms();
    void closeModifiers();

    ZyrCalculationNodeHeader* connectNodeHeaderToCalculationNode(HsDbEntity* entity,
                                                                 HeaderMaker maker,
                                                                 ZyrCalculationNode* node);
    ZyrCalculationNodeData* connectNodeDataToCalculationNode(HsDbEntity* entity,
                                                             ZyrAreaCalculationAlgorithm* algorithm,
                                                             NodeDataMaker maker,
                                                             ZyrCalculationNode* node);
    // The name of a class of pushed objects, made once per class and shared by their headers.
    const ZyrRmCString& className(const HsRxClass* cls);
    ZyrCalculationNodeHeader* areaNodeHeader(HsDbEntity* entity);
    ZyrCalculationNodeHeader* areaGroupNodeHeader(HsDbEntity* entity);
    void handleGroupChilds(const std::vector<HsDbObjectId>& ids, PushFunction push,
                           ZyrCalculationNode* parent,
                           const std::vector<ZyrCalculationNodeData*>& parentData);
    void foldIntoParent(const ZyrCalculationNode& child,
                        const std::vector<ZyrCalculationNodeData*>& parentData) const;
    void handleModifiers(const ZyrDbEntity* entity, ZyrAreaCalculationAlgorithm* algorithm,
                         ZyrCalculationNodeData* data);
    void modifierDataVector(const ZyrDbEntity* entity, ZyrAreaCalculationAlgorithm* algorithm,
                            std::vector<int>& indices);
    const ZyrDbAreaModifier* cachedModifier(const HsDbObjectId& id,
                                            const ZyrDbAreaModifier* previous);
    int modifierDataIndex(const ZyrDbAreaModifier& modifier);

    ZyrAreaCalculationWhiteBoard* whiteBoard = nullptr;
    ZyrAreaCalculationStream* stream = nullptr;
    ZyrAreaCalculationBitmapCreator* bitmapCreator = nullptr;
    // The display-representation classes whose previews the headers of areas and groups carry.
    HsRxClass* areaDispRepClass = nullptr;
    HsRxClass* groupDispRepClass = nullptr;
    AlgorithmVector algorithms;
    AlgorithmVector::iterator algorithmsBegin;
    AlgorithmVector::iterator algorithmsEnd;
    AlgorithmVector::iterator currentAlgorithm;
    // Every modifier opened by this calculation, open for read until closeModifiers.
    std::map<HsDbObjectId, ZyrDbAreaModifier*> modifiers;
    PostfixCallback postfixCallback = nullptr;
    void* postfixCallbackData = nullptr;
    std::map<const HsRxClass*, PushFunction> pushFunctions;
    // The few classes of the objects pushed so far, with their names.
    std::vector<std::pair<const HsRxClass*, ZyrRmCString>> classNames;
    // The groups from the root down to the one being pushed.
    std::unordered_set<HsDbObjectId> groupsOnPath;
};
