#include "tools/zyrarea/ZyrAreaTool.h"

#include "areacalc/calc/ZyrAreaCalculationEngine.h"
#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/ut/HsutConsole.h"
#include "platform/host/ut/HsutUtf8.h"
#include "tools/zyrarea/ZyrAreaCalculationReport.h"
#include "tools/zyrarea/ZyrAreaToolHost.h"
#include "tools/zyrarea/ZyrDemoDrawing.h"

#include <iostream>

namespace {

int fail(const std::string& what, Hsys::ErrorStatus status, const std::wstring& reason = {}) {
    std::cerr << "zyrarea: " << what << ": " << Hsys::toString(status) << " ("
              << static_cast<int>(status) << ")";
    if (!reason.empty())
        std::cerr << ": " << hsutToUtf8(reason);
    std::cerr << '\n';
    return 1;
}

int calculateAndShow(HsDbDatabase& database, const std::string& title,
                     const ZyrAreaTool::Options& options) {
    ZyrAreaCalculationStream stream;
    ZyrAreaCalculationEngine engine;
    const Hsys::ErrorStatus status =
        engine.calculate(ZyrAreaCalculationReport::rootsOf(database), &stream, nullptr, nullptr);
    if (status != Hsys::eSuccess)
        return fail("calculating " + title, status);
    if (options.dump) {
        stream.dumpToHsysTxtWindow();
        return 0;
    }
    hsutPrintf(L"Area calculation of %S\n\n", title.c_str());
    ZyrAreaCalculationReport::print(ZyrAreaCalculationReport::rows(database, stream));
    return 0;
}

} // namespace

int ZyrAreaTool::demo(const Options& options) {
    const ZyrAreaToolHost host;
    if (host.status() != Hsys::eSuccess)
        return fail("starting the area module", host.status());
    HsDbDatabase database;
    if (const Hsys::ErrorStatus status = ZyrDemoDrawing::build(database); status != Hsys::eSuccess)
        return fail("building the demo drawing", status);
    if (!options.saveAs.empty()) {
        std::wstring reason;
        const Hsys::ErrorStatus status =
            database.saveAs(hsutFromUtf8(options.saveAs).c_str(), &reason);
        if (status != Hsys::eSuccess)
            return fail("saving " + options.saveAs, status, reason);
    }
    return calculateAndShow(database, "the demo floor plan", options);
}

int ZyrAreaTool::calc(const std::string& drawingFile, const Options& options) {
    const ZyrAreaToolHost host;
    if (host.status() != Hsys::eSuccess)
        return fail("starting the area module", host.status());
    HsDbDatabase database(HsDb::kEmptyDatabase);
    std::wstring reason;
    if (const Hsys::ErrorStatus status =
            database.readDrawingFile(hsutFromUtf8(drawingFile).c_str(), &reason);
        status != Hsys::eSuccess)
        return fail("reading " + drawingFile, status, reason);
    return calculateAndShow(database, drawingFile, options);
}
