// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Serializable.h>

#include <cstddef>
#include <deque>
#include <memory>
#include <string>
#include <vector>

namespace GoldenTests {

/// The objects that a frozen document was saved from, built anew by the names that the code has for fields
/// and enumerators: so a document pins the numbers of those as well.
class Sample
{
public:
    /// An object that lives as long as the sample.
    template <class T>
    T& make()
    {
        return *row<T>(1);
    }
    /// Neighbours, since sets and maps of pointers are stored in the order of addresses.
    template <class T>
    T* row(std::size_t count)
    {
        const auto objects = std::make_shared<std::vector<T>>(count);
        m_owned.push_back(objects);
        return objects->data();
    }
    /// An object that stands in the list of the document.
    template <class T>
    T& root()
    {
        T& object = make<T>();
        roots.push_back(&object);
        return object;
    }

    std::deque<const Serialize::ISerializable*> roots;

private:
    std::deque<std::shared_ptr<void>> m_owned;
};

/// A document is named after the class that it shows.
struct NamedSample
{
    std::string name;
    void (*fill)(Sample& sample);
};

std::vector<NamedSample> mediaSamples();
std::vector<NamedSample> effectSamples();
std::vector<NamedSample> librarySamples();
std::vector<NamedSample> timelineSamples();

/// One small project with what is stored beside it.
NamedSample wholeProject();
/// A red and a blue pixel, as the preview of two items.
NamedSample sharedPicture();

} // namespace GoldenTests
