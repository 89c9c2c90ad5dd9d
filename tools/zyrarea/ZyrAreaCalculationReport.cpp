#include "tools/zyrarea/ZyrAreaCalculationReport.h"

#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "platform/base/summary/ZyrDisplayFormat.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/ut/HsutConsole.h"

#include <algorithm>
#include <unordered_set>

namespace {

using Row = std::vector<std::wstring>;
using IdSet = std::unordered_set<HsDbObjectId>;

const std::vector<ZyrAreaCalculationAlgorithm*>& attachedAlgorithms() {
    static const std::vector<ZyrAreaCalculationAlgorithm*> none;
    ZyrAreaCalculationHdxServices* services = ZyrAreaCalculationHdxServices::service();
    ZyrAreaCalculationWhiteBoard* board = services != nullptr ? services->whiteBoard() : nullptr;
    return board != nullptr ? board->algorithmVector() : none;
}

// What the members of one group are, noted while the drawing is walked.
void noteMembers(const ZyrDbAreaGroup& group, IdSet& heldGroups, IdSet& heldAreas) {
    const ZyrGroupHandler* handler = group.groupHandler();
    heldGroups.insert(handler->nodes().begin(), handler->nodes().end());
    heldAreas.insert(handler->leafs().begin(), handler->leafs().end());
}

class RowWriter {
public:
    RowWriter(HsDbDatabase& database, const ZyrAreaCalculationStream& stream)
        : m_database(database), m_stream(stream), m_algorithms(attachedAlgorithms()) {}

    std::vector<Row> write() {
        m_rows.push_back(titles());
        // A reused stream may hold null roots; they stand for nothing.
        for (const ZyrCalculationNode* root : m_stream.roots())
            if (root != nullptr)
                writeNode(*root, 0);
        return std::move(m_rows);
    }

private:
    Row titles() const {
        Row row{L"Name"};
        for (const ZyrAreaCalculationAlgorithm* algorithm : m_algorithms) {
            ZyrRmCString name;
            algorithm->displayName(name);
            row.push_back(name.str() + L" gross");
            row.push_back(name.str() + L" net");
        }
        return row;
    }

    void writeNode(const ZyrCalculationNode& node, int depth) {
        Row row{std::wstring(static_cast<size_t>(depth) * 2, L' ') +
                m_stream.nodeHeader(node)->name.str()};
        for (const ZyrAreaCalculationAlgorithm* algorithm : m_algorithms) {
            const ZyrCalculationNodeData* data = dataOf(node, algorithm);
            row.push_back(data != nullptr ? format(*data, data->grossValue) : L"");
            row.push_back(data != nullptr ? format(*data, data->netValue) : L"");
        }
        m_rows.push_back(std::move(row));
        writeModifierSteps(node, depth + 1);
        for (const ZyrCalculationNode* child : node.children)
            writeNode(*child, depth + 1);
    }

    // One row of a single cell per modifier step of each value, in the order of the algorithms
    // and then of application.
    void writeModifierSteps(const ZyrCalculationNode& node, int depth) {
        const std::wstring indent(static_cast<size_t>(depth) * 2, L' ');
        for (const ZyrAreaCalculationAlgorithm* algorithm : m_algorithms) {
            const ZyrCalculationNodeData* data = dataOf(node, algorithm);
            if (data == nullptr)
                continue;
            ZyrRmCString algorithmName;
            algorithm->displayName(algorithmName);
            for (int i = 0; i < m_stream.nModifierBlocks(*data); ++i)
                m_rows.push_back({indent + modifierStep(*data, m_stream.modifierBlockAt(*data, i),
                                                        algorithmName.str())});
        }
    }

    // "Sloping roof: _AREA_VALUE_ * 0.5, Area 20.00 m² before, 10.00 m² after".
    std::wstring modifierStep(const ZyrCalculationNodeData& data, const ZyrModifierBlock& block,
                              const std::wstring& algorithmName) const {
        std::wstring text = L"?";
        const size_t index = static_cast<size_t>(block.modifierIndex);
        // The block's index is the stream's own, but a reader does not stake a crash on it.
        if (block.modifierIndex >= 0 && index < m_stream.modifierDataVector().size()) {
            const ZyrModifierData* modifier = m_stream.modifierData(block);
            text = modifier->name.str() + L": " + modifier->expression.str();
        }
        return text + L", " + algorithmName + L" " + format(data, block.beforeValue) +
               L" before, " + format(data, block.afterValue) + L" after";
    }

    const ZyrCalculationNodeData* dataOf(const ZyrCalculationNode& node,
                                         const ZyrAreaCalculationAlgorithm* algorithm) const {
        for (int i = 0; i < m_stream.nNodeDatas(node); ++i) {
            const ZyrCalculationNodeData* data = m_stream.nodeDataAt(node, i);
            if (data->algorithmClassName.str() == algorithm->isA()->name())
                return data;
        }
        return nullptr;
    }

    // Areas in square units, everything else the algorithms measure is a length.
    std::wstring format(const ZyrCalculationNodeData& data, double value) const {
        ZyrRmCString text;
        if (data.algorithmClassName.str() == ZyrAreaCalculationAreaAlgorithm::desc()->name())
            Zyr::formatAreaForDisplay(&m_database, value, text);
        else
            Zyr::formatDistanceForDisplay(&m_database, value, text);
        return text.str();
    }

    HsDbDatabase& m_database;
    const ZyrAreaCalculationStream& m_stream;
    const std::vector<ZyrAreaCalculationAlgorithm*>& m_algorithms;
    std::vector<Row> m_rows;
};

// The widest cell of each column, over the rows that are split into columns.
std::vector<size_t> columnWidths(const std::vector<Row>& rows) {
    std::vector<size_t> widths;
    for (const Row& row : rows) {
        if (row.size() == 1)
            continue;
        widths.resize(std::max(widths.size(), row.size()));
        for (size_t i = 0; i < row.size(); ++i)
            widths[i] = std::max(widths[i], row[i].size());
    }
    return widths;
}

// Names to the left, figures to the right, so that decimal points line up.
std::wstring alignedLine(const Row& row, const std::vector<size_t>& widths) {
    std::wstring line;
    for (size_t i = 0; i < row.size(); ++i) {
        const std::wstring padding(widths[i] - row[i].size(), L' ');
        line += i == 0 ? row[i] + padding : L"  " + padding + row[i];
    }
    return line;
}

} // namespace

std::vector<HsDbObjectId> ZyrAreaCalculationReport::rootsOf(const HsDbDatabase& database) {
    std::vector<HsDbObjectId> candidates;
    IdSet heldGroups;
    IdSet heldAreas;
    for (const HsDbObjectId& id : database.objectIds()) {
        HsDbObject* object = nullptr;
        if (hsdbOpenObject(object, id, HsDb::kForRead, false) != Hsys::eSuccess)
            continue;
        if (const ZyrDbAreaGroup* group = ZyrDbAreaGroup::cast(object)) {
            noteMembers(*group, heldGroups, heldAreas);
            candidates.push_back(id);
        } else if (ZyrDbArea::cast(object) != nullptr) {
            candidates.push_back(id);
        }
        (void)object->close();
    }
    std::erase_if(candidates, [&](const HsDbObjectId& id) {
        return heldGroups.contains(id) || heldAreas.contains(id);
    });
    return candidates;
}

std::vector<Row> ZyrAreaCalculationReport::rows(HsDbDatabase& database,
                                                const ZyrAreaCalculationStream& stream) {
    return RowWriter(database, stream).write();
}

void ZyrAreaCalculationReport::print(const std::vector<Row>& rows) {
    const std::vector<size_t> widths = columnWidths(rows);
    for (const Row& row : rows)
        hsutPrintf(L"%s\n", row.size() == 1 ? row[0].c_str() : alignedLine(row, widths).c_str());
}
