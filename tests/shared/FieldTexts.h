// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/shared/FieldVisitors.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <memory>
#include <sstream>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

/// What is common to the tests of the persistent classes.
namespace Testing {

/// A field of an object: its key, and all that stands under it, in the words of Dump.
using FieldText = std::pair<std::string, std::string>;

/// The fields of an object of a registered class, in the order in which they are written.
inline std::vector<FieldText> fieldTexts(const Serialize::ISerializable& object)
{
    std::vector<FieldText> fields;
    std::istringstream dump(Dump::of(object));
    std::string line;
    std::getline(dump, line);
    while (std::getline(dump, line)) {
        const bool isNested = line.compare(2, 1, " ") == 0;
        const std::size_t colon = line.find(':');
        if (isNested)
            fields.back().second += '\n' + line.substr(2);
        else
            fields.emplace_back(line.substr(2, colon - 2), line.substr(std::min(colon + 2, line.size())));
    }
    return fields;
}

inline std::vector<std::string> fieldKeys(const Serialize::ISerializable& object)
{
    std::vector<std::string> keys;
    for (const FieldText& field : fieldTexts(object))
        keys.push_back(field.first);
    return keys;
}

/// The keys of the fields that are as in a default-constructed object.
template <class T>
std::vector<std::string> defaultFields(const T& object)
{
    const std::vector<FieldText> fields = fieldTexts(object);
    const std::vector<FieldText> defaults = fieldTexts(T());
    std::vector<std::string> same;
    for (std::size_t i = 0; i != fields.size(); ++i) {
        if (fields[i] == defaults[i])
            same.push_back(fields[i].first);
    }
    return same;
}

/// Objects of the class answer to the name, and the name makes one.
template <class T>
void expectMadeByName(const std::string& name)
{
    EXPECT_EQ(T::NameInArchive(), name);
    EXPECT_EQ(T().GetNameInArchive(), name);
    const Serialize::BaseCreator* const creator = Serialize::findCreator(name);
    ASSERT_NE(creator, nullptr);
    const std::unique_ptr<Serialize::ISerializable> made(creator->Create());
    ASSERT_NE(dynamic_cast<T*>(made.get()), nullptr);
    EXPECT_EQ(Dump::of(*made), Dump::of(T()));
}

/// No cast leads down from a virtual base by itself.
template <class Base, class Derived, class = void>
constexpr bool isVirtualBase = std::is_base_of_v<Base, Derived>;
template <class Base, class Derived>
constexpr bool
    isVirtualBase<Base, Derived, std::void_t<decltype(static_cast<Derived*>(std::declval<Base*>()))>> = false;

} // namespace Testing
