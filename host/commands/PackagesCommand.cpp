// SPDX-License-Identifier: Apache-2.0
#include "host/commands/PackagesCommand.h"

#include "host/packages/PackageShelf.h"
#include "host/text/DisplayText.h"
#include "host/text/Table.h"

#include <EditorModel/library/Pack.h>

#include <QFileInfo>

#include <string>

namespace Host {
namespace {

template <class T>
std::string categoriesOf(const CollectionItem<T>& item)
{
    std::string text;
    for (const QString& category : item.categories) {
        text += (text.empty() ? "" : ", ") + printable(category);
    }
    return text;
}

template <class T>
void addRows(Table& table, const char* kind, const CollectionItems<T>& items)
{
    for (const auto& item : items) {
        table.addRow({kind, printable(item->uniqueId), printable(item->item->tag),
                      printable(item->collectionId), categoriesOf(*item)});
    }
}

std::string headingOf(const PackageContent& package)
{
    const QString name = package.pack ? package.pack->productName("en_US") : QString();
    return printable(package.appId) + (name.isEmpty() ? "" : ": " + printable(name)) + '\n' +
           printable(package.folder) + '\n';
}

std::string textOf(const PackageContent& package)
{
    Table table({Table::Left, Table::Left, Table::Left, Table::Left, Table::Left});
    table.addRow({"Kind", "Identifier", "Name", "Collection", "Categories"});
    addRows(table, "overlay", package.itemsOf<Overlay::Preset>());
    addRows(table, "transition", package.itemsOf<Transition::Object>());
    addRows(table, "effect", package.itemsOf<Effect::Object>());
    addRows(table, "import", package.itemsOf<Import::Object>());
    addRows(table, "quiz", package.itemsOf<Quiz::Preset>());
    std::string text = headingOf(package);
    for (const std::string& line : table.lines()) {
        text += line + '\n';
    }
    return text;
}

} // namespace

ExitCode showPackages(const QStringList& folders)
{
    PackageShelf shelf;
    bool isSound = true;
    for (const QString& folder : folders) {
        // What is no folder is a fault of its own.
        if (shelf.put(folder) == 0 && QFileInfo(folder).isDir()) {
            writeError(folder, QStringLiteral("holds no package"));
            isSound = false;
        }
    }
    std::string text;
    for (const PackageContent* package : shelf.packages()) {
        text += (text.empty() ? "" : "\n") + textOf(*package);
    }
    if (!writeOutput(text)) {
        return Failure;
    }
    for (const PackageFault& fault : shelf.faults()) {
        writeError(fault.file.isEmpty() ? fault.package : fault.package + ": " + fault.file, fault.reason);
        isSound = false;
    }
    return isSound ? Success : Failure;
}

} // namespace Host
