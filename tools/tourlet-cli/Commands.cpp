#include "Commands.h"

std::vector<CliCommand> allCommands()
{
    std::vector<CliCommand> commands;
    commands.push_back(encodeCommand());
    return commands;
}
