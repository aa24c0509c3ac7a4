// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/CommandLine.h"

namespace Host {

// Each adds one command, with its options, to the command line.

void addProbe(CommandLine& line);
void addCurve(CommandLine& line);
void addPackages(CommandLine& line);

void addShow(CommandLine& line);
void addPicture(CommandLine& line);
void addCheck(CommandLine& line);
void addConvert(CommandLine& line);
void addCompare(CommandLine& line);
void addPlay(CommandLine& line);
void addThumbs(CommandLine& line);

void addNew(CommandLine& line);
void addEdit(CommandLine& line);
void addTrack(CommandLine& line);

} // namespace Host
