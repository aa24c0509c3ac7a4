// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/Image.h>
#include <EditorModel/types/MTime.h>

#include <QList>
#include <QMap>
#include <QPointF>
#include <QString>

#include <deque>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <tuple>
#include <utility>

/// Persistent classes that between them have every kind of field.
namespace Sample {

enum Shade : int
{
    Light = 0,
    Dark = 7,
};

class Leaf : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Leaf)

    Leaf() = default;
    Leaf(int aNumber, const QString& aText) : number(aNumber), text(aText) {}

    int number = 0;
    QString text;
};

/// Stored as a `Leaf` is, under a name of the same length; a pointer to a `Leaf` does not take it.
class Moss : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Moss)

    int number = 0;
    QString text;
};

class Trunk : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Trunk)

    double girth = 0.0;
};

class Bark : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Bark)

    bool rough = false;
    const Bark* next = nullptr;
};

/// Two persistent bases, every kind of value, and pointers that can make cycles.
class Tree : public Trunk, public Bark
{
    EDITORMODEL_PERSISTENT(Tree)

    bool flag = false;
    int whole = 0;
    quint32 colour = 0;
    qint64 large = 0;
    double real = 0.0;
    std::string bytes;
    QString text;
    MTime time;
    QPointF point;
    Shade shade = Light;
    QString reversed; ///< stored turned round
    const Tree* other = nullptr;
    const Leaf* leaf = nullptr;
    const Leaf* sameLeaf = nullptr;
    const Leaf* soft = nullptr;
    const Serialize::ISerializable* anything = nullptr;
    Leaf inner;
};

/// Every kind of container.
class Grove : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Grove)

    std::deque<const Tree*> row;
    std::deque<int> numbers;
    std::deque<Leaf> litter;
    std::deque<std::deque<QString>> words;
    std::set<const Leaf*> leaves;
    std::map<const Leaf*, MTime> falls;
    std::map<QString, Leaf> named;
    std::map<int, std::map<int, double>> grid;
    std::pair<const Leaf*, const Leaf*> couple;
    std::tuple<QString, int, Shade> triple;
    QMap<QString, QString> notes;
    QList<const Leaf*> list;
};

class Album : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Album)

    std::shared_ptr<const Types::Image> cover;
    std::shared_ptr<const Types::Image> back;
};

/// No fields at all.
class Nothing : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Nothing)
};

/// Counts its deletions.
class Counted : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Counted)

    Counted() = default;
    Counted(const Counted&) = default;
    Counted& operator=(const Counted&) = default;
    ~Counted() override { ++s_deleted; }

    static int s_deleted;

    const Counted* next = nullptr;
    const Counted* also = nullptr;
};

/// Derived from a persistent class, but not one itself.
class Stray : public Leaf
{};

} // namespace Sample

EDITORMODEL_ARCHIVE_NAME(Sample::Leaf, "Sample::Leaf")
EDITORMODEL_ARCHIVE_NAME(Sample::Moss, "Sample::Moss")
EDITORMODEL_ARCHIVE_NAME(Sample::Trunk, "Sample::Trunk")
EDITORMODEL_ARCHIVE_NAME(Sample::Bark, "Sample::Bark")
EDITORMODEL_ARCHIVE_NAME(Sample::Tree, "Sample::Tree")
EDITORMODEL_ARCHIVE_NAME(Sample::Grove, "Sample::Grove")
EDITORMODEL_ARCHIVE_NAME(Sample::Album, "Sample::Album")
EDITORMODEL_ARCHIVE_NAME(Sample::Counted, "Sample::Counted")
EDITORMODEL_ARCHIVE_NAME(Sample::Nothing, "Sample::Nothing")
