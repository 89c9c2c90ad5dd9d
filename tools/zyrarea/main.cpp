// zyrarea: calculates the areas of a drawing, or of an embedded sample plan, and prints them.
#include "tools/zyrarea/ZyrAreaTool.h"

#include <CLI/CLI.hpp>

int main(int argc, char** argv) {
    CLI::App app{"Calculates the areas and perimeters of a drawing's area groups and areas."};
    app.require_subcommand(1);

    ZyrAreaTool::Options options;
    CLI::App* demo = app.add_subcommand("demo", "Calculate the embedded sample floor plan.");
    demo->add_flag("--dump", options.dump, "Print the calculation stream's own dump instead.");
    demo->add_option("--save", options.saveAs, "Also write the demo drawing to this file.");

    std::string drawingFile;
    CLI::App* calc = app.add_subcommand("calc", "Calculate the areas of a drawing file.");
    calc->add_option("DRAWING", drawingFile, "The drawing file to read.")->required();
    calc->add_flag("--dump", options.dump, "Print the calculation stream's own dump instead.");

    CLI11_PARSE(app, argc, argv);
    if (demo->parsed())
        return ZyrAreaTool::demo(options);
    return ZyrAreaTool::calc(drawingFile, options);
}
