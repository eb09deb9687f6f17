// beamweaver: renders one pattern described in a JSON job file and reports what it produced.
#include "module/class_table.h"
#include "tools/command_line.h"

#include <iostream>

int main(int argc, char** argv) {
    using namespace Norvane::Lumis::Scanning;
    const Tool::CommandLine commandLine = Tool::ParseCommandLine(argc, argv, std::cout, std::cerr);
    if (!commandLine.render)
        return commandLine.exitCode;
    RegisterComponents();
    return Tool::RunRender(*commandLine.render, std::cout, std::cerr);
}
