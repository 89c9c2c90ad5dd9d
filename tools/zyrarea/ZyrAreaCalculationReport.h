// A drawing's calculation as the tool shows it: the top of its tree of groups and areas
// calculated, and the result printed as an indented table.
#pragma once

#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <string>
#include <vector>

class HsDbDatabase;
class ZyrAreaCalculationStream;

class ZyrAreaCalculationReport {
public:
    ZyrAreaCalculationReport() = delete;

    // The live groups that no live group holds and the live areas that no live group holds, in
    // the order of their handles: calculating them reaches every member exactly where it belongs.
    static std::vector<HsDbObjectId> rootsOf(const HsDbDatabase& database);
    // The result rows, one per node in tree order: the name indented by two spaces per level,
    // then gross and net of each attached algorithm, in the drawing's display units ("" where a
    // group did not allow the algorithm). The first row holds the column titles. Under a node's
    // row, one row of a single cell per step a value of it took through a modifier: indented one
    // level deeper, the modifier's name, its formula with the parameters written in, the
    // algorithm and the value before and after the step.
    static std::vector<std::vector<std::wstring>> rows(HsDbDatabase& database,
                                                       const ZyrAreaCalculationStream& stream);
    // The rows in aligned columns on the host's console. A row of a single cell is a line of its
    // own: it does not widen the first column.
    static void print(const std::vector<std::vector<std::wstring>>& rows);
};
