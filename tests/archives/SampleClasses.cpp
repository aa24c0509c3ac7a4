// SPDX-License-Identifier: Apache-2.0
#include "tests/archives/SampleClasses.h"

#include <EditorModel/persistence/Fields.h>

#include <algorithm>

namespace Sample {
namespace {

QString turned(const QString& text)
{
    QString result = text;
    std::reverse(result.begin(), result.end());
    return result;
}

} // namespace

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
    f("rough", bark.rough)("next", bark.next);
}

void fields(Serialize::Fields& f, Tree& tree)
{
    f.base<Trunk>("Sample::Trunk", tree).base<Bark>("Sample::Bark", tree);
    f("flag", tree.flag)("whole", tree.whole)("colour", tree.colour)("large", tree.large)("real", tree.real);
    f("bytes", tree.bytes)("text", tree.text)("time", tree.time)("point", tree.point)("shade", tree.shade);
    f.coded("reversed", tree.reversed, turned, turned);
    f("other", tree.other)("leaf", tree.leaf)("sameLeaf", tree.sameLeaf);
    f.soft("soft", tree.soft);
    f("anything", tree.anything)("inner", tree.inner);
}

void fields(Serialize::Fields& f, Grove& grove)
{
    f("row", grove.row)("numbers", grove.numbers)("litter", grove.litter)("words", grove.words);
    f("leaves", grove.leaves)("falls", grove.falls)("named", grove.named)("grid", grove.grid);
    f("couple", grove.couple)("triple", grove.triple)("notes", grove.notes)("list", grove.list);
}

void fields(Serialize::Fields& f, Album& album)
{
    f("cover", album.cover)("back", album.back);
}

int Counted::s_deleted = 0;

void fields(Serialize::Fields& f, Counted& counted)
{
    f("next", counted.next)("also", counted.also);
}

void fields(Serialize::Fields&, Nothing&) {}

} // namespace Sample

EDITORMODEL_PERSISTENT_CLASS(Sample::Leaf)
EDITORMODEL_PERSISTENT_CLASS(Sample::Moss)
EDITORMODEL_PERSISTENT_CLASS(Sample::Trunk)
EDITORMODEL_PERSISTENT_CLASS(Sample::Bark)
EDITORMODEL_PERSISTENT_CLASS(Sample::Tree, Sample::Trunk, Sample::Bark)
EDITORMODEL_PERSISTENT_CLASS(Sample::Grove)
EDITORMODEL_PERSISTENT_CLASS(Sample::Album)
EDITORMODEL_PERSISTENT_CLASS(Sample::Counted)
EDITORMODEL_PERSISTENT_CLASS(Sample::Nothing)
