// SPDX-License-Identifier: Apache-2.0
#include "host/commands/CommandTable.h"

#include <clocale>
#include <csignal>
#include <cstdlib>
#include <string>

#include <langinfo.h>

namespace {

/// File names are taken for UTF-8 also where the locale knows none: otherwise Qt could not name them at all.
void useUtf8()
{
    std::setlocale(LC_ALL, "");
    if (std::string(nl_langinfo(CODESET)) != "UTF-8") {
        setenv("LC_ALL", "C.UTF-8", 1);
        std::setlocale(LC_ALL, "");
    }
}

} // namespace

int main(int argc, char** argv)
{
    useUtf8();
    // A reader who ends early must not keep what is to be saved from being saved.
    std::signal(SIGPIPE, SIG_IGN);

    Host::CommandLine line;
    // In the order of the help.
    Host::addProbe(line);
    Host::addShow(line);
    Host::addCurve(line);
    Host::addNew(line);
    Host::addEdit(line);
    Host::addPicture(line);
    Host::addThumbs(line);
    Host::addPlay(line);
    Host::addCheck(line);
    Host::addConvert(line);
    Host::addTrack(line);
    Host::addCompare(line);
    Host::addPackages(line);
    return line.run(argc, argv);
}
