// SPDX-License-Identifier: Apache-2.0
#include "Samples.h"
#include "Streaming.h"

#include <EditorModel/persistence/Fields.h>

#include <QBuffer>

#include <boost/archive/archive_exception.hpp>

#include <typeinfo>

using namespace StreamTest;

namespace {

template <class Act>
void expectUnregistered(Act act)
{
    try {
        act();
        ADD_FAILURE() << "went through";
    } catch (const boost::archive::archive_exception& error) {
        EXPECT_EQ(error.code, boost::archive::archive_exception::unregistered_class);
        EXPECT_THAT(error.what(), testing::HasSubstr("derived class not registered or exported"));
    }
}

/// The document of one class with the name of another of the same length in its place.
QByteArray renamed(Document::Form form, const Serialize::ISerializable& root, const char* from,
                   const char* to)
{
    QByteArray document = saved(form, root);
    EXPECT_TRUE(document.contains(from));
    return document.replace(from, to);
}

} // namespace

TEST_P(Streams, GiveBackNullPointers)
{
    const Loaded loaded(GetParam(), saved(GetParam(), {nullptr}));
    EXPECT_EQ(loaded.roots().front(), nullptr);
}

TEST_P(Streams, StoreAnObjectOnceHoweverManyPointersLeadToIt)
{
    Leaf leaf;
    leaf.number = 4;
    Tree tree;
    tree.leaf = tree.sameLeaf = tree.soft = &leaf;
    tree.anything = &leaf;
    const Loaded loaded(GetParam(), saved(GetParam(), {&tree, &leaf}), 2);
    const Tree& copy = loaded.root<Tree>();
    ASSERT_NE(copy.leaf, nullptr);
    EXPECT_EQ(copy.leaf->number, 4);
    EXPECT_EQ(copy.sameLeaf, copy.leaf);
    EXPECT_EQ(copy.soft, copy.leaf);
    EXPECT_EQ(copy.anything, copy.leaf);
    EXPECT_EQ(&loaded.root<Leaf>(1), copy.leaf);
}

TEST_P(Streams, ReadCycles)
{
    Tree first;
    Tree second;
    first.other = &second;
    second.other = &first;
    second.anything = &second;
    const Loaded loaded(GetParam(), saved(GetParam(), first));
    const Tree& copy = loaded.root<Tree>();
    ASSERT_NE(copy.other, nullptr);
    EXPECT_NE(copy.other, &copy);
    EXPECT_EQ(copy.other->other, &copy);
    EXPECT_EQ(copy.other->anything, copy.other);
}

TEST_P(Streams, ResolvePointersToObjectsHeldByValue)
{
    Tree tree;
    tree.leaf = &tree.inner;
    tree.anything = &tree.pen;
    const Loaded loaded(GetParam(), saved(GetParam(), {&tree, &tree.inner}), 2);
    const Tree& copy = loaded.root<Tree>();
    EXPECT_EQ(copy.leaf, &copy.inner);
    EXPECT_EQ(copy.anything, &copy.pen);
    EXPECT_EQ(loaded.roots()[1], &copy.inner);
}

TEST_P(Streams, ResolvePointersToItemsOfContainers)
{
    Grove grove;
    grove.litter.resize(3);
    grove.named["one"].number = 1;
    grove.couple = {&grove.litter[2], &grove.named["one"]};
    const Loaded loaded(GetParam(), saved(GetParam(), grove));
    const Grove& copy = loaded.root<Grove>();
    EXPECT_EQ(copy.couple.first, &copy.litter[2]);
    EXPECT_EQ(copy.couple.second, &copy.named.at("one"));
}

TEST_P(Streams, RefuseAPointerWrittenBeforeTheObjectThatIsHeldByValue)
{
    Nest nest;
    nest.before = &nest.egg;
    try {
        saved(GetParam(), nest);
        ADD_FAILURE() << "was written";
    } catch (const std::runtime_error& error) {
        EXPECT_STREQ(error.what(),
                     "an object of the class \"StreamTest::Leaf\" is held by value, but a pointer to "
                     "it was written before");
    }
}

TEST_P(Streams, WriteTheSameValueTwiceAsTwoObjects)
{
    Leaf leaf;
    leaf.number = 3;
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    const auto writer = Serialize::makeStreamWriter(GetParam(), buffer);
    writer->stream().field({"a", &leaf});
    writer->writeObject(leaf);
    writer->stream().field({"b", &leaf});
    writer->writeObject(leaf);
    writer->finish();

    Leaf a;
    Leaf b;
    const auto reader = Serialize::makeStreamReader(GetParam(), buffer.data());
    reader->stream().field({"a", &a});
    reader->readObject(a);
    reader->stream().field({"b", &b});
    reader->readObject(b);
    reader->finish();
    EXPECT_EQ(a.number, 3);
    EXPECT_EQ(b.number, 3);
    EXPECT_TRUE(reader->made().empty());
}

TEST_P(Streams, TakeASingleRootWithoutAField)
{
    Leaf leaf;
    leaf.number = 3;
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    const auto writer = Serialize::makeStreamWriter(GetParam(), buffer);
    leaf.Serialize(*writer);
    writer->finish();
    Leaf copy;
    const auto reader = Serialize::makeStreamReader(GetParam(), buffer.data());
    copy.Deserialize(*reader);
    reader->finish();
    EXPECT_EQ(copy.number, 3);
}

TEST_P(Streams, ReadNullThroughASoftPointerOfAnotherClass)
{
    const Leaf leaf;
    Twig twig;
    twig.soft = &leaf;
    const Loaded loaded(GetParam(), renamed(GetParam(), twig, "StreamTest::Leaf", "StreamTest::Moss"));
    EXPECT_EQ(loaded.root<Twig>().soft, nullptr);
}

TEST_P(Streams, RefuseAnotherClassThroughAStrictPointer)
{
    const Leaf leaf;
    Twig twig;
    twig.strict = &leaf;
    const QByteArray document = renamed(GetParam(), twig, "StreamTest::Leaf", "StreamTest::Moss");
    EXPECT_THROW(Loaded(GetParam(), document), std::bad_cast);
}

TEST_P(Streams, RefuseAReferenceToAnotherClassThroughAStrictPointer)
{
    const Leaf leaf;
    Twig twig;
    twig.soft = &leaf;
    twig.strict = &leaf;
    const QByteArray document = renamed(GetParam(), twig, "StreamTest::Leaf", "StreamTest::Moss");
    EXPECT_THROW(Loaded(GetParam(), document), std::bad_cast);
}

TEST_P(Streams, RefuseAClassThatNobodyRegistered)
{
    Tree tree;
    const Nameless nameless;
    tree.anything = &nameless;
    expectUnregistered([&] { saved(GetParam(), tree); });
}

TEST_P(Streams, RefuseAClassThatOnlyItsBaseRegistered)
{
    Tree tree;
    const Stray stray;
    tree.anything = &stray;
    expectUnregistered([&] { saved(GetParam(), tree); });
}

TEST_P(Streams, RefuseTheNameOfAClassThatNobodyRegistered)
{
    const Leaf leaf;
    const QByteArray document = renamed(GetParam(), leaf, "StreamTest::Leaf", "StreamTest::Loaf");
    expectUnregistered([&] { Loaded(GetParam(), document); });
}

TEST_P(Streams, TakeAnUnregisteredClassByValue)
{
    Secret secret;
    secret.number = 11;
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    const auto writer = Serialize::makeStreamWriter(GetParam(), buffer);
    writer->stream().field({"secret", &secret});
    writer->writeObject(secret);
    writer->stream().field({"pointer", &secret});
    writer->writePointer(&secret);
    writer->finish();
    Secret copy;
    Serialize::ISerializable* pointer = nullptr;
    const auto reader = Serialize::makeStreamReader(GetParam(), buffer.data());
    reader->stream().field({"secret", &copy});
    reader->readObject(copy);
    reader->stream().field({"pointer", &pointer});
    reader->readPointer(pointer);
    reader->finish();
    EXPECT_EQ(copy.number, 11);
    EXPECT_EQ(pointer, &copy);
}

TEST_P(Streams, TakeClassesThatHaveNoFieldList)
{
    Foreign first;
    Foreign second;
    first.number = 1;
    first.next = &second;
    second.number = 2;
    second.next = &first;
    const int living = Foreign::s_living;
    {
        const Loaded loaded(GetParam(), saved(GetParam(), first));
        const Foreign& copy = loaded.root<Foreign>();
        EXPECT_EQ(copy.number, 1);
        ASSERT_NE(copy.next, nullptr);
        EXPECT_EQ(copy.next->number, 2);
        EXPECT_EQ(copy.next->next, &copy);
        EXPECT_EQ(Foreign::s_living, living + 2);
    }
    EXPECT_EQ(Foreign::s_living, living);
}

TEST_P(Streams, FreeWhatAFailedLoadHadMade)
{
    Foreign first;
    Foreign second;
    first.next = &second;
    const int living = Foreign::s_living;
    const QByteArray document = saved(GetParam(), first);
    EXPECT_NE(failureOf(GetParam(), document.left(document.size() - 20)).text, "");
    EXPECT_EQ(Foreign::s_living, living);
}

TEST_P(Streams, TellWhatTheyMade)
{
    Tree tree;
    Leaf leaf;
    tree.leaf = &leaf;
    const auto reader = Serialize::makeStreamReader(GetParam(), saved(GetParam(), tree));
    reader->stream().field({"root", nullptr});
    Serialize::ISerializable* root = nullptr;
    reader->readPointer(root);
    ASSERT_EQ(reader->made().size(), 2u);
    EXPECT_EQ(reader->made()[0], root);
    EXPECT_EQ(reader->made()[1], dynamic_cast<Tree&>(*root).leaf);
    for (const auto* object : reader->made())
        delete object;
}

TEST_P(Streams, TakeObjectsNestedToTheLimitAndNoDeeper)
{
    std::deque<Chain> chains(Serialize::Details::maxDepth);
    for (std::size_t i = 1; i < chains.size(); ++i)
        chains[i - 1].next = &chains[i];
    const Loaded loaded(GetParam(), saved(GetParam(), chains.front()));
    int length = 0;
    for (const Chain* link = &loaded.root<Chain>(); link; link = link->next)
        ++length;
    EXPECT_EQ(length, 1000);

    Chain more;
    more.next = &chains.front();
    try {
        saved(GetParam(), more);
        ADD_FAILURE() << "was written";
    } catch (const std::runtime_error& error) {
        EXPECT_STREQ(error.what(), "objects nest deeper than 1000 levels");
    }
}
