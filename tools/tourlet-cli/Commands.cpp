#include "Commands.h"

std::vector<CliCommand> allCommands()
{
    std::vector<CliCommand> commands;
    commands.push_back(curveCommand());
    commands.push_back(projectCommand());
    commands.push_back(convertCommand());
    return commands;
}
