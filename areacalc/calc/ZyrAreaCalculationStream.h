// The result of one calculation: a forest of nodes whose payload lives in three flat tables.
#pragma once

#include "areacalc/calc/ZyrBitmapHandle.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/base/zyrtl/zyrtlPool.h"
#include "platform/host/db/HsDbObjectId.h"

#include <cstdint>
#include <vector>

class ZyrPrimitiveExpressionHandlerFactory;
class ZyrAreaCalculationStreamWriter;

// One pushed object in the tree. Indices, not pointers, bind it to the stream's tables, so that
// many nodes share one header and pushing never copies a record.
struct ZyrCalculationNode {
    ZYRTL_POOLED_RECORD

    ZyrCalculationNode* parent = nullptr;
    int headerIndex = 0;
    // Owned; child groups first, then leaf areas.
    std::vector<ZyrCalculationNode*> children;
    // One per algorithm evaluated on this node, in the order of the algorithms.
    std::vector<int> nodeDataIndices;
};

// What is known of the object itself; at most one per object in a stream.
struct ZyrCalculationNodeHeader {
    ZYRTL_POOLED_RECORD

    ZyrRmCString className;
    HsDbObjectId objectId;
    ZyrRmCString name;
    ZyrRmCString description;
    ZyrBitmapHandle bitmap = nullptr;
};

// One application of one modifier to one value.
struct ZyrModifierBlock {
    int modifierIndex = 0;
    ZyrRmCString beforeName;
    double beforeValue = 0.0;
    ZyrRmCString afterName;
    double afterValue = 0.0;
};

// The result of one algorithm on one object. A gross value is the value before modifiers, a net
// value the value after them.
struct ZyrCalculationNodeData {
    ZYRTL_POOLED_RECORD

    virtual ~ZyrCalculationNodeData();

    HsDbObjectId objectId;
    // The key that matches a child's record to its parent's when values are folded.
    ZyrRmCString algorithmClassName;
    ZyrRmCString grossName;
    double grossValue = 0.0;
    ZyrRmCString netName;
    double netValue = 0.0;
    std::vector<ZyrModifierBlock> modifierBlocks;
};

// An area value proved piece by piece: the pieces stand beside the gross value as an independent
// figure, and neither modifiers nor the sums of groups touch them.
struct ZyrDecomposedCalculationNodeData : ZyrCalculationNodeData {
    struct DecomposedUnit {
        ZyrRmCString name;
        // Negative for a subtracted piece.
        double value = 0.0;
        // The actual parameters of the piece's formula pattern.
        std::vector<double> parameters;
        std::uint32_t handlerId = 0;
    };

    ZyrBitmapHandle decomposedBitmap = nullptr;
    ZyrRmCString decomposedName;
    double decomposedValue = 0.0;
    std::vector<DecomposedUnit> units;
};

// What is known of one modifier object; at most one per modifier in a stream.
struct ZyrModifierData {
    ZYRTL_POOLED_RECORD

    ZyrRmCString name;
    ZyrRmCString description;
    HsDbObjectId objectId;
    // With its parameters replaced by their values.
    ZyrRmCString expression;
};

// Matches a node data record by object and by the exact algorithm class name (case matters).
class StreamContentCheckerOidAndString {
public:
    StreamContentCheckerOidAndString(const HsDbObjectId& objectId, const ZyrRmCString& className)
        : m_objectId(objectId), m_className(className) {}
    bool operator()(const ZyrCalculationNodeData* data) const;

private:
    const HsDbObjectId& m_objectId;
    const ZyrRmCString& m_className;
};

// Deletes a node and its whole subtree, children before parents, and nulls the caller's pointer.
void deleteTreeNode(ZyrCalculationNode*& node);

// The stream owns its forest and every record of its tables. Readers never change it; the one way
// in is ZyrAreaCalculationStreamWriter, which keeps the lookups of headers and modifier records
// in step with their tables, so that they answer in constant time what a search from the front of
// the table would answer.
class ZyrAreaCalculationStream {
public:
    using NodeVector = std::vector<ZyrCalculationNode*>;
    using NodeHeaderVector = std::vector<ZyrCalculationNodeHeader*>;
    using NodeDataVector = std::vector<ZyrCalculationNodeData*>;
    using ModifierDataVector = std::vector<ZyrModifierData*>;

    ZyrAreaCalculationStream() = default;
    ZyrAreaCalculationStream(const ZyrAreaCalculationStream&) = delete;
    ZyrAreaCalculationStream& operator=(const ZyrAreaCalculationStream&) = delete;
    virtual ~ZyrAreaCalculationStream();

    // Frees all content. The root slots stay, each set to null: a reader of a reused stream skips
    // null roots, and later roots follow behind them.
    void reset();

    const NodeVector& roots() const { return m_roots; }
    ZyrCalculationNodeHeader* nodeHeader(const ZyrCalculationNode& node) const;
    int nNodeDatas(const ZyrCalculationNode& node) const;
    ZyrCalculationNodeData* nodeDataAt(const ZyrCalculationNode& node, int i) const;
    int nModifierBlocks(const ZyrCalculationNodeData& data) const;
    const ZyrModifierBlock& modifierBlockAt(const ZyrCalculationNodeData& data, int i) const;
    ZyrModifierData* modifierData(const ZyrModifierBlock& block) const;
    const NodeHeaderVector& nodeHeaderVector() const { return m_nodeHeaders; }
    const NodeDataVector& nodeDataVector() const { return m_nodeDatas; }
    const ModifierDataVector& modifierDataVector() const { return m_modifierDatas; }

    // On a hit, index is the first position in table order and the result true; on a miss index
    // is left as it was.
    bool hasNodeHeaderFor(const HsDbObjectId& objectId, int& index) const;
    bool hasModifierDataFor(const HsDbObjectId& objectId, int& index) const;
    bool hasNodeDataFor(const HsDbObjectId& objectId, const ZyrRmCString& algorithmClassName,
                        int& index) const;

    // Prints the whole stream on the host's text console. Not for a stream with null roots.
    void dumpToHsysTxtWindow() const;
    // Prints one node and its subtree.
    void dumpNode(const ZyrCalculationNode& node,
                  const ZyrPrimitiveExpressionHandlerFactory* factory) const;
    // The stream is not filed.
    void saveAs() const {}

private:
    friend class ZyrAreaCalculationStreamWriter;

    // The first table position of each object id, in one flat array probed linearly: a
    // calculation adds a header for nearly every object, and chained nodes cost an allocation
    // and a cache miss each.
    class FirstPositions {
    public:
        bool find(const HsDbObjectId& objectId, int& index) const;
        // Keeps the position already entered for the id.
        void insert(const HsDbObjectId& objectId, int index);
        void clear() {
            m_slots.clear();
            m_used = 0;
        }

    private:
        struct Slot {
            HsDbObjectId objectId;
            // Negative while the slot is free.
            int index = -1;
            // Picks the slot at any size of the table up to 2^32 slots.
            std::uint32_t hash = 0;
        };
        static std::uint32_t hashOf(const HsDbObjectId& objectId);
        void insert(const Slot& entry);
        void grow();

        std::vector<Slot> m_slots;
        size_t m_used = 0;
    };

    void dumpNodeData(const ZyrCalculationNodeData& data) const;

    NodeVector m_roots;
    NodeHeaderVector m_nodeHeaders;
    NodeDataVector m_nodeDatas;
    ModifierDataVector m_modifierDatas;
    // The first position of every object id in m_nodeHeaders and m_modifierDatas.
    FirstPositions m_headerPositions;
    FirstPositions m_modifierPositions;
};

// The calculation's access to a stream: it appends to the forest and to the tables, which take
// ownership. Each append answers the position of the new record.
class ZyrAreaCalculationStreamWriter {
public:
    explicit ZyrAreaCalculationStreamWriter(ZyrAreaCalculationStream& stream) : m_stream(stream) {}

    // A root has no parent.
    void appendRoot(ZyrCalculationNode* node);
    // A second header of one object is kept, but lookups keep finding the first.
    int appendNodeHeader(ZyrCalculationNodeHeader* header);
    int appendNodeData(ZyrCalculationNodeData* data);
    int appendModifierData(ZyrModifierData* data);

private:
    ZyrAreaCalculationStream& m_stream;
};
