// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/ConstructionLog.h>
#include <EditorModel/persistence/streams/Streams.h>

#include <QByteArray>

#include <gmock/gmock.h>

#include <initializer_list>
#include <random>
#include <string>
#include <vector>

namespace StreamTest {

/// A document with a pointer under "root" for each object.
QByteArray saved(Document::Form form, std::initializer_list<const Serialize::ISerializable*> roots);
QByteArray saved(Document::Form form, const Serialize::ISerializable& root);

/// The objects of a document, freed with this.
class Loaded
{
public:
    Loaded(Document::Form form, const QByteArray& document, int roots = 1);

    template <class T>
    const T& root(std::size_t index = 0) const
    {
        return dynamic_cast<const T&>(*m_roots.at(index));
    }

    const std::vector<Serialize::ISerializable*>& roots() const { return m_roots; }

private:
    Serialize::Details::ConstructionLog m_log;
    std::vector<Serialize::ISerializable*> m_roots;
};

/// What a load of the document throws, and where reading then stands; empty where it throws nothing.
struct Failure
{
    std::string text;
    std::string position;
};
Failure failureOf(Document::Form form, const QByteArray& document);

/// Loads the document; where that works, all of it is walked through and must be as good as any other.
void expectSoundOrRefused(Document::Form form, const QByteArray& document);

/// The document with a few bytes changed, inserted, removed or repeated elsewhere.
QByteArray damaged(QByteArray document, std::mt19937& random);

std::string nameOf(const testing::TestParamInfo<Document::Form>& form);

/// Tests that are run in every form.
class Streams : public testing::TestWithParam<Document::Form>
{
protected:
    template <class T>
    static T copied(const T& object)
    {
        const Loaded loaded(GetParam(), saved(GetParam(), object));
        return loaded.root<T>();
    }
};

} // namespace StreamTest
