// The tool's jobs run in-process: the demo plan's figures, which a reader can check by hand, and
// the same figures from the drawing file the demo writes.
#include "tools/zyrarea/ZyrAreaTool.h"
#include "tools/zyrarea/ZyrAreaToolHost.h"

#include "platform/host/ut/HsutConsole.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <functional>
#include <string>
#include <unistd.h>

namespace {

class ZyrAreaToolTest : public testing::Test {
public:
    // Keeps the module's service alive between the jobs, each of which takes and gives back a
    // dependency of its own: the service dies for good when the last one goes.
    static void SetUpTestSuite() {
        static ZyrAreaToolHost host;
        ASSERT_EQ(host.status(), Hsys::eSuccess);
    }

protected:
    static std::wstring run(const std::function<int()>& job, int expectedExit = 0) {
        HsutConsoleCapture capture;
        EXPECT_EQ(job(), expectedExit);
        return capture.text();
    }
    // The text after the title line, which names where the plan came from.
    static std::wstring table(const std::wstring& output) {
        return output.substr(output.find(L"\n\n") + 2);
    }
};

TEST_F(ZyrAreaToolTest, demoPrintsGroupsBeforeAreasWithSumsAndEachModifierStep) {
    // Rooms are width x depth: Kitchen 4 x 5 is 20 m² with 18 m around it. The attic room, 4 x 5
    // under the sloping roof, counts half; the balcony, 4 x 1.5, a quarter through its parameter
    // "share". Groups sum their members' net values; perimeters count in full. The sample area is
    // 80 + 12π less a 22.5 m² triangle.
    const std::wstring expected =
        L"Name             Area gross  Area net  Perimeter gross  Perimeter net\n"
        L"House             107.00 m²  92.50 m²         108.00 m       108.00 m\n"
        L"  Attic            20.00 m²  10.00 m²          18.00 m        18.00 m\n"
        L"    Attic room     20.00 m²  10.00 m²          18.00 m        18.00 m\n"
        L"      Sloping roof: _AREA_VALUE_ * 0.5, Area 20.00 m² before, 10.00 m² after\n"
        L"  Ground floor     60.00 m²  60.00 m²          54.00 m        54.00 m\n"
        L"    Hall           10.00 m²  10.00 m²          14.00 m        14.00 m\n"
        L"    Kitchen        20.00 m²  20.00 m²          18.00 m        18.00 m\n"
        L"    Living room    30.00 m²  30.00 m²          22.00 m        22.00 m\n"
        L"  Upper floor      27.00 m²  22.50 m²          36.00 m        36.00 m\n"
        L"    Balcony         6.00 m²   1.50 m²          11.00 m        11.00 m\n"
        L"      Balcony share: _AREA_VALUE_ * 0.25, Area 6.00 m² before, 1.50 m² after\n"
        L"    Bath            5.00 m²   5.00 m²           9.00 m         9.00 m\n"
        L"    Bedroom        16.00 m²  16.00 m²          16.00 m        16.00 m\n"
        L"Sample area        95.20 m²  95.20 m²          68.50 m        68.50 m\n";
    const std::wstring output = run([] { return ZyrAreaTool::demo({}); });
    EXPECT_EQ(output.substr(0, output.find(L'\n')), L"Area calculation of the demo floor plan");
    EXPECT_EQ(table(output), expected);

    const std::wstring dump = run([] { return ZyrAreaTool::demo({true, ""}); });
    EXPECT_EQ(dump.find(L"\nArea Calculation\n\n\nRoot node 1\n\nHouse\nArea 107.000000\n"
                        L"Net area 92.500000\nPerimeter 108.000000\n"),
              0u)
        << dump.substr(0, 200);
}

TEST_F(ZyrAreaToolTest, theSavedDemoDrawingCalculatesAlike) {
    const std::filesystem::path file = std::filesystem::temp_directory_path() /
                                       ("zyrarea-tool-" + std::to_string(::getpid()) + ".drawing");
    const std::wstring fromDemo = run([&] { return ZyrAreaTool::demo({false, file.string()}); });
    const std::wstring fromFile = run([&] { return ZyrAreaTool::calc(file.string(), {}); });
    std::filesystem::remove(file);
    EXPECT_EQ(table(fromFile), table(fromDemo));
    EXPECT_EQ(fromFile.substr(0, fromFile.find(L'\n')),
              L"Area calculation of " + std::wstring(file.wstring()));

    // A missing file is a message on standard error and exit code 1, with nothing printed.
    EXPECT_EQ(run([&] { return ZyrAreaTool::calc(file.string(), {}); }, 1), L"");
}

} // namespace
