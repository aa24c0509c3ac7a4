// SPDX-License-Identifier: Apache-2.0
// Opens a project and saves it under another name, in the locale of the environment.
#include "host/project/ProjectStore.h"

#include <QGuiApplication>
#include <QLocale>

#include <clocale>
#include <cstdio>
#include <exception>
#include <locale>

int main(int argc, char** argv)
{
    // Pictures need one.
    const QGuiApplication application(argc, argv);
    if (argc != 3 || !std::setlocale(LC_ALL, ""))
        return 2;
    try {
        std::locale::global(std::locale(""));
        QLocale::setDefault(QLocale::system());
        const Host::OpenedProject project = Host::ProjectStore::open(QString::fromUtf8(argv[1]));
        Host::ProjectStore::save(project.content(), QString::fromUtf8(argv[2]));
    } catch (const std::exception& error) {
        std::fprintf(stderr, "%s\n", error.what());
        return 1;
    }
    // For the test to see which sign stands before the decimals.
    std::printf("%.1f", 0.5);
    return 0;
}
