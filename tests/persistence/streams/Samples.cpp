// SPDX-License-Identifier: Apache-2.0
#include "Samples.h"

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/persistence/Serializer.h>

namespace StreamTest {

void fields(Serialize::Fields& f, Leaf& leaf)
{
    f("number", leaf.number)("text", leaf.text);
}

void fields(Serialize::Fields& f, Moss& moss)
{
    f("number", moss.number)("text", moss.text);
}

void fields(Serialize::Fields& f, Trunk& trunk)
{
    f("girth", trunk.girth);
}

void fields(Serialize::Fields& f, Bark& bark)
{
    f("rough", bark.rough);
}

void fields(Serialize::Fields& f, Tree& tree)
{
    f.base<Trunk>("Trunk", tree).base<Bark>("Bark", tree);
    f("flag", tree.flag)("whole", tree.whole)("colour", tree.colour)("large", tree.large)("real", tree.real);
    f("time", tree.time)("bytes", tree.bytes)("text", tree.text)("point", tree.point)("mood", tree.mood);
    f("pen", tree.pen)("inner", tree.inner)("leaf", tree.leaf)("sameLeaf", tree.sameLeaf);
    f.soft("soft", tree.soft)("other", tree.other)("anything", tree.anything);
}

void fields(Serialize::Fields& f, Grove& grove)
{
    f("numbers", grove.numbers)("litter", grove.litter)("words", grove.words)("row", grove.row);
    f("leaves", grove.leaves)("names", grove.names)("falls", grove.falls)("named", grove.named);
    f("grid", grove.grid)("couple", grove.couple)("triple", grove.triple)("notes", grove.notes);
    f("list", grove.list);
}

void fields(Serialize::Fields& f, Sheet& sheet)
{
    f.base<Trunk>("Trunk", sheet)("title", sheet.title)("numbers", sheet.numbers)("marks", sheet.marks);
    f("couple", sheet.couple)("place", sheet.place)("start", sheet.start)("gain", sheet.gain);
    f("inner", sheet.inner)("leaf", sheet.leaf)("self", sheet.self)("none", sheet.none);
}

void fields(Serialize::Fields& f, Album& album)
{
    f("cover", album.cover)("back", album.back);
}

void fields(Serialize::Fields& f, Chain& chain)
{
    f("next", chain.next);
}

void fields(Serialize::Fields& f, Twig& twig)
{
    f.soft("soft", twig.soft)("strict", twig.strict);
}

void fields(Serialize::Fields& f, Nest& nest)
{
    f("before", nest.before)("egg", nest.egg)("after", nest.after);
}

void fields(Serialize::Fields& f, Secret& secret)
{
    f("number", secret.number);
}

namespace {

class ForeignCreator : public Serialize::BaseCreator
{
    Serialize::ISerializable* Create() const override { return new Foreign; }
};

const Serialize::Registrator foreignRegistrator("StreamTest::Foreign", new ForeignCreator);

} // namespace

int Foreign::s_living = 0;

Foreign::Foreign()
{
    ++s_living;
}

Foreign::Foreign(const Foreign& other) : ISerializable(other), number(other.number), next(other.next)
{
    ++s_living;
}

Foreign::~Foreign()
{
    --s_living;
}

const std::string Foreign::GetNameInArchive() const
{
    return "StreamTest::Foreign";
}

void Foreign::Serialize(Serialize::ISerializer& serializer) const
{
    int value = number;
    serializer.stream().beginClass({"StreamTest::Foreign", this});
    serializer.stream().field({"number", &number});
    serializer.stream().value(&value);
    serializer.stream().field({"next", &next});
    serializer.writePointer(next);
    serializer.stream().endClass({"StreamTest::Foreign", this});
}

void Foreign::Deserialize(Serialize::IDeserializer& deserializer)
{
    deserializer.stream().beginClass({"StreamTest::Foreign", this});
    deserializer.stream().field({"number", &number});
    deserializer.stream().value(&number);
    deserializer.stream().field({"next", &next});
    ISerializable* object = nullptr;
    deserializer.readPointer(object);
    next = object ? &dynamic_cast<const Foreign&>(*object) : nullptr;
    deserializer.stream().endClass({"StreamTest::Foreign", this});
}

const std::string Nameless::GetNameInArchive() const
{
    return "StreamTest::Nameless";
}

void Nameless::Serialize(Serialize::ISerializer& serializer) const
{
    serializer.stream().beginClass({"StreamTest::Nameless", this});
    serializer.stream().endClass({"StreamTest::Nameless", this});
}

void Nameless::Deserialize(Serialize::IDeserializer& deserializer)
{
    deserializer.stream().beginClass({"StreamTest::Nameless", this});
    deserializer.stream().endClass({"StreamTest::Nameless", this});
}

} // namespace StreamTest

EDITORMODEL_PERSISTENT_CLASS(StreamTest::Leaf)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Moss)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Trunk)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Bark)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Tree, StreamTest::Trunk, StreamTest::Bark)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Grove)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Sheet, StreamTest::Trunk)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Album)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Chain)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Twig)
EDITORMODEL_PERSISTENT_CLASS(StreamTest::Nest)
EDITORMODEL_PERSISTENT_CLASS_UNREGISTERED(StreamTest::Secret, "StreamTest::Secret")
