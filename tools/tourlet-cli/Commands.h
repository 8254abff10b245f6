#pragma once

#include "CliCommand.h"

#include <vector>

// Every subcommand, in the order --help lists them. Each lives in its own file.
std::vector<CliCommand> allCommands();

CliCommand curveCommand();
CliCommand projectCommand();
CliCommand convertCommand();
CliCommand gpxCommand();
CliCommand trackCommand();
CliCommand contentCommand();
CliCommand encodeCommand();
CliCommand eventsCommand();
