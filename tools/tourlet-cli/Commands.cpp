#include "Commands.h"

std::vector<CliCommand> allCommands()
{
    std::vector<CliCommand> commands;
    commands.push_back(curveCommand());
    commands.push_back(projectCommand());
    commands.push_back(convertCommand());
    commands.push_back(gpxCommand());
    commands.push_back(trackCommand());
    commands.push_back(contentCommand());
    commands.push_back(encodeCommand());
    commands.push_back(eventsCommand());
    return commands;
}
