// swatchlog: the command-line tool over the Redavudeva chart library.
#include <iostream>
#include <locale>

#include "command_line.h"
#include "commands.h"

int main(int argc, char** argv) {
    // Numbers are written with a decimal point and no grouping whatever the locale.
    std::cout.imbue(std::locale::classic());
    std::cerr.imbue(std::locale::classic());
    swatchlog::PrepareConsole();
    const swatchlog::Words args = swatchlog::CommandLineWords(argc, argv);
    const int status = swatchlog::RunTool(args, std::cout, std::cerr);
    std::cout.flush();
    return std::cout.good() ? status : 1;
}
