// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/Image.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Pen.h>

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

/// Persistent classes with every kind of field, and a few that go without field lists.
namespace StreamTest {

enum Mood : int
{
    Calm = 0,
    Wild = 5,
};

class Leaf : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Leaf)

    int number = 0;
    QString text;
};

/// Stored as a `Leaf` is, but none.
class Moss : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Moss)

    int number = 0;
    QString text;
};

/// Derived from a persistent class, but not one itself.
class Stray : public Leaf
{};

class Trunk : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Trunk)

    double girth = 0.0;
};

class Bark : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Bark)

    bool rough = false;
};

/// Every kind of value, two bases, and pointers of every kind.
class Tree : public Trunk, public Bark
{
    EDITORMODEL_PERSISTENT(Tree)

    bool flag = false;
    int whole = 0;
    quint32 colour = 0;
    qint64 large = 0;
    double real = 0.0;
    MTime time;
    std::string bytes;
    QString text;
    QPointF point;
    Mood mood = Calm;
    Types::Pen pen;
    Leaf inner;
    const Leaf* leaf = nullptr;
    const Leaf* sameLeaf = nullptr;
    const Leaf* soft = nullptr;
    const Tree* other = nullptr;
    const Serialize::ISerializable* anything = nullptr;
};

/// Every kind of container.
class Grove : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Grove)

    std::deque<int> numbers;
    std::deque<Leaf> litter;
    std::deque<std::deque<QString>> words;
    std::deque<const Leaf*> row;
    std::set<const Leaf*> leaves;
    std::set<QString> names;
    std::map<const Leaf*, MTime> falls;
    std::map<QString, Leaf> named;
    std::map<int, std::map<int, double>> grid;
    std::pair<const Leaf*, const Leaf*> couple;
    std::tuple<QString, int, Mood> triple;
    QMap<QString, QString> notes;
    QList<const Leaf*> list;
};

/// A small class with one of everything that looks different in a document.
class Sheet : public Trunk
{
    EDITORMODEL_PERSISTENT(Sheet)

    QString title;
    std::deque<int> numbers;
    std::map<QString, int> marks;
    std::pair<int, bool> couple;
    QPointF place;
    MTime start;
    double gain = 0.0;
    Leaf inner;
    const Leaf* leaf = nullptr;
    const Sheet* self = nullptr;
    const Leaf* none = nullptr;
};

class Album : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Album)

    std::shared_ptr<const Types::Image> cover;
    std::shared_ptr<const Types::Image> back;
};

class Chain : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Chain)

    const Chain* next = nullptr;
};

class Twig : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Twig)

    const Leaf* soft = nullptr;
    const Leaf* strict = nullptr;
};

/// Points at what it holds by value, before and behind it.
class Nest : public Serialize::ISerializable
{
    EDITORMODEL_PERSISTENT(Nest)

    const Leaf* before = nullptr;
    Leaf egg;
    const Leaf* after = nullptr;
};

/// Written and read only where its type is known.
class Secret : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT_UNREGISTERED(Secret)

    int number = 0;
};

/// A client's class: registered, with bodies of its own and no field list.
class Foreign : public Serialize::ISerializable
{
public:
    Foreign();
    Foreign(const Foreign& other);
    ~Foreign() override;
    Foreign& operator=(const Foreign&) = default;

    const std::string GetNameInArchive() const override;
    void Serialize(Serialize::ISerializer& serializer) const override;
    void Deserialize(Serialize::IDeserializer& deserializer) override;

    int number = 0;
    const Foreign* next = nullptr;

    static int s_living;
};

/// A client's class that nobody registered.
class Nameless : public Serialize::ISerializable
{
public:
    const std::string GetNameInArchive() const override;
    void Serialize(Serialize::ISerializer& serializer) const override;
    void Deserialize(Serialize::IDeserializer& deserializer) override;
};

} // namespace StreamTest

EDITORMODEL_ARCHIVE_NAME(StreamTest::Leaf, "StreamTest::Leaf")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Moss, "StreamTest::Moss")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Trunk, "StreamTest::Trunk")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Bark, "StreamTest::Bark")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Tree, "StreamTest::Tree")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Grove, "StreamTest::Grove")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Sheet, "StreamTest::Sheet")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Album, "StreamTest::Album")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Chain, "StreamTest::Chain")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Twig, "StreamTest::Twig")
EDITORMODEL_ARCHIVE_NAME(StreamTest::Nest, "StreamTest::Nest")
