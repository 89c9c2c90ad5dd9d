#include "areacalc/calc/ZyrAreaCalculationStream.h"

#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "platform/base/zyrtl/zyrtlDelete.h"
#include "platform/host/ut/HsAssertionViolation.h"
#include "platform/host/ut/HsutConsole.h"

#include <algorithm>
#include <chrono>

ZyrCalculationNodeData::~ZyrCalculationNodeData() = default;

bool StreamContentCheckerOidAndString::operator()(const ZyrCalculationNodeData* data) const {
    return data != nullptr && data->objectId == m_objectId &&
           data->algorithmClassName == m_className;
}

void deleteTreeNode(ZyrCalculationNode*& node) {
    if (node == nullptr) {
        node = nullptr;
        return;
    }
    // A copy, so that the walk does not depend on what deleting a child does to the list.
    std::vector<ZyrCalculationNode*> children = node->children;
    for (ZyrCalculationNode*& child : children)
        deleteTreeNode(child);
    delete node;
    node = nullptr;
}

ZyrAreaCalculationStream::~ZyrAreaCalculationStream() {
    reset();
}

void ZyrAreaCalculationStream::reset() {
    // Tree and tables are independent: the tables go first, the forest last.
    std::for_each(m_modifierDatas.begin(), m_modifierDatas.end(),
                  zyrtl::deleteItem<ZyrModifierData*>());
    m_modifierDatas.clear();
    m_modifierPositions.clear();

    // One record may stand in the table twice; it is deleted once.
    NodeDataVector distinct = m_nodeDatas;
    std::sort(distinct.begin(), distinct.end());
    distinct.erase(std::unique(distinct.begin(), distinct.end()), distinct.end());
    for (ZyrCalculationNodeData* data : distinct)
        delete data;
    m_nodeDatas.clear();

    // The bitmaps belong to whoever made them.
    std::for_each(m_nodeHeaders.begin(), m_nodeHeaders.end(),
                  zyrtl::deleteItem<ZyrCalculationNodeHeader*>());
    m_nodeHeaders.clear();
    m_headerPositions.clear();

    for (ZyrCalculationNode*& root : m_roots)
        deleteTreeNode(root);
}

ZyrCalculationNodeHeader*
ZyrAreaCalculationStream::nodeHeader(const ZyrCalculationNode& node) const {
    return m_nodeHeaders[static_cast<size_t>(node.headerIndex)];
}

int ZyrAreaCalculationStream::nNodeDatas(const ZyrCalculationNode& node) const {
    return static_cast<int>(node.nodeDataIndices.size());
}

ZyrCalculationNodeData* ZyrAreaCalculationStream::nodeDataAt(const ZyrCalculationNode& node,
                                                             int i) const {
    return m_nodeDatas[static_cast<size_t>(node.nodeDataIndices[static_cast<size_t>(i)])];
}

int ZyrAreaCalculationStream::nModifierBlocks(const ZyrCalculationNodeData& data) const {
    return static_cast<int>(data.modifierBlocks.size());
}

const ZyrModifierBlock&
ZyrAreaCalculationStream::modifierBlockAt(const ZyrCalculationNodeData& data, int i) const {
    return data.modifierBlocks[static_cast<size_t>(i)];
}

ZyrModifierData* ZyrAreaCalculationStream::modifierData(const ZyrModifierBlock& block) const {
    return m_modifierDatas[static_cast<size_t>(block.modifierIndex)];
}

namespace {

// Drawings are read from files, and files choose their handles: a salt no file can know keeps
// crafted handles from piling up in one place of the table. The clock at first use and where the
// loader placed this library differ from run to run; neither can fail the way a random device can.
std::uint64_t handleSalt() {
    static const std::uint64_t salt =
        static_cast<std::uint64_t>(std::chrono::steady_clock::now().time_since_epoch().count()) ^
        static_cast<std::uint64_t>(reinterpret_cast<std::uintptr_t>(&handleSalt));
    return salt;
}

} // namespace

std::uint32_t ZyrAreaCalculationStream::FirstPositions::hashOf(const HsDbObjectId& objectId) {
    // The members of a group are mostly made one after the other and pushed one after the
    // other: runs of neighbouring handles keep neighbouring slots and share cache lines, while
    // the multiplication scatters the runs over the table.
    constexpr unsigned kRunBits = 4;
    const std::uint64_t handle = objectId.handle();
    const std::uint64_t run = ((handle >> kRunBits) ^ handleSalt()) * 0x9E3779B97F4A7C15ull;
    return static_cast<std::uint32_t>(((run >> 32) << kRunBits) |
                                      (handle & ((1u << kRunBits) - 1)));
}

bool ZyrAreaCalculationStream::FirstPositions::find(const HsDbObjectId& objectId,
                                                    int& index) const {
    if (m_slots.empty())
        return false;
    const size_t mask = m_slots.size() - 1;
    for (size_t slot = hashOf(objectId) & mask;; slot = (slot + 1) & mask) {
        const Slot& entry = m_slots[slot];
        if (entry.index < 0)
            return false;
        if (entry.objectId == objectId) {
            index = entry.index;
            return true;
        }
    }
}

void ZyrAreaCalculationStream::FirstPositions::insert(const HsDbObjectId& objectId, int index) {
    insert({objectId, index, hashOf(objectId)});
}

void ZyrAreaCalculationStream::FirstPositions::insert(const Slot& entry) {
    // At most half full, so that a probe ends soon on a free slot.
    if (2 * (m_used + 1) > m_slots.size())
        grow();
    const size_t mask = m_slots.size() - 1;
    size_t slot = entry.hash & mask;
    for (; m_slots[slot].index >= 0; slot = (slot + 1) & mask)
        if (m_slots[slot].objectId == entry.objectId)
            return;
    m_slots[slot] = entry;
    ++m_used;
}

void ZyrAreaCalculationStream::FirstPositions::grow() {
    std::vector<Slot> old(std::max<size_t>(64, 2 * m_slots.size()));
    old.swap(m_slots);
    m_used = 0;
    // The kept hashes spare a visit to every id's entry.
    for (const Slot& entry : old)
        if (entry.index >= 0)
            insert(entry);
}

bool ZyrAreaCalculationStream::hasNodeHeaderFor(const HsDbObjectId& objectId, int& index) const {
    return m_headerPositions.find(objectId, index);
}

bool ZyrAreaCalculationStream::hasModifierDataFor(const HsDbObjectId& objectId, int& index) const {
    return m_modifierPositions.find(objectId, index);
}

bool ZyrAreaCalculationStream::hasNodeDataFor(const HsDbObjectId& objectId,
                                              const ZyrRmCString& algorithmClassName,
                                              int& index) const {
    const auto found = std::find_if(m_nodeDatas.begin(), m_nodeDatas.end(),
                                    StreamContentCheckerOidAndString(objectId, algorithmClassName));
    if (found == m_nodeDatas.end())
        return false;
    index = static_cast<int>(found - m_nodeDatas.begin());
    return true;
}

void ZyrAreaCalculationStream::dumpToHsysTxtWindow() const {
    hsutPrintf(L"\nArea Calculation\n\n");
    const ZyrPrimitiveExpressionHandlerFactory* factory = nullptr;
    if (ZyrAreaCalculationHdxServices* services = ZyrAreaCalculationHdxServices::service())
        factory = services->expressionHandlerFactory();
    int position = 1;
    for (const ZyrCalculationNode* root : m_roots) {
        hsutPrintf(L"\nRoot node %d\n", position++);
        dumpNode(*root, factory);
    }
    hsutPrintf(L"\n");
}

void ZyrAreaCalculationStream::dumpNode(const ZyrCalculationNode& node,
                                        const ZyrPrimitiveExpressionHandlerFactory* factory) const {
    const ZyrCalculationNodeHeader* header = nodeHeader(node);
    hsutPrintf(L"\n%s", header->name.GetString());
    if (!header->description.IsEmpty())
        hsutPrintf(L"(%s)", header->description.GetString());
    for (int index : node.nodeDataIndices)
        dumpNodeData(*m_nodeDatas[static_cast<size_t>(index)]);
    for (const ZyrCalculationNode* child : node.children)
        dumpNode(*child, factory);
}

void ZyrAreaCalculationStream::dumpNodeData(const ZyrCalculationNodeData& data) const {
    hsutPrintf(L"\n%s %f", data.grossName.GetString(), data.grossValue);
    hsutPrintf(L"\n%s %f", data.netName.GetString(), data.netValue);
    if (const auto* decomposed = dynamic_cast<const ZyrDecomposedCalculationNodeData*>(&data))
        hsutPrintf(L"\n    %s %f", decomposed->decomposedName.GetString(),
                   decomposed->decomposedValue);
    int position = 0;
    for (const ZyrModifierBlock& block : data.modifierBlocks) {
        const ZyrModifierData* modifier = modifierData(block);
        hsutPrintf(L"\n    %d. %s (%s)  Before %f after %f", position++, modifier->name.GetString(),
                   modifier->description.GetString(), block.beforeValue, block.afterValue);
    }
}

void ZyrAreaCalculationStreamWriter::appendRoot(ZyrCalculationNode* node) {
    if (node != nullptr)
        node->parent = nullptr;
    m_stream.m_roots.push_back(node);
}

namespace {

template <class Record, class Positions>
int appendIndexed(std::vector<Record*>& table, Positions& positions, Record* record,
                  const char* what) {
    if (record == nullptr)
        throw HsAssertionViolation(std::string("a calculation stream takes no null ") + what);
    const int index = static_cast<int>(table.size());
    table.push_back(record);
    // The first record of an object stays the one that is found.
    positions.insert(record->objectId, index);
    return index;
}

} // namespace

int ZyrAreaCalculationStreamWriter::appendNodeHeader(ZyrCalculationNodeHeader* header) {
    return appendIndexed(m_stream.m_nodeHeaders, m_stream.m_headerPositions, header, "header");
}

int ZyrAreaCalculationStreamWriter::appendNodeData(ZyrCalculationNodeData* data) {
    const int index = static_cast<int>(m_stream.m_nodeDatas.size());
    m_stream.m_nodeDatas.push_back(data);
    return index;
}

int ZyrAreaCalculationStreamWriter::appendModifierData(ZyrModifierData* data) {
    return appendIndexed(m_stream.m_modifierDatas, m_stream.m_modifierPositions, data,
                         "modifier record");
}
