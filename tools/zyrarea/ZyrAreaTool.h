// The jobs of the command-line tool, apart from the parsing of its command line.
#pragma once

#include <string>

class ZyrAreaTool {
public:
    struct Options {
        // Print the stream's own console dump instead of the table.
        bool dump = false;
        // Where demo writes its drawing; nothing is written when empty.
        std::string saveAs;
    };

    ZyrAreaTool() = delete;

    // Each answers the process's exit code: 0, or 1 with a message on standard error.
    static int demo(const Options& options);
    static int calc(const std::string& drawingFile, const Options& options);
};
