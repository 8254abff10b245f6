#include "Commands.h"

std::vector<CliCommand> allCommands()
{
    std::vector<CliCommand> commands;
    return commands;
}
