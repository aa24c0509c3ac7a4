// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Json.h>

#include <boost/archive/xml_iarchive.hpp>
#include <boost/archive/xml_oarchive.hpp>
#include <boost/serialization/nvp.hpp>

#include <sstream>
#include <string>

namespace GoldenTests {

/// The XML archive of an object under the key "content", as any client of the archives writes it.
template <class T>
std::string saved(const T& content)
{
    std::ostringstream stream;
    {
        boost::archive::xml_oarchive archive(stream);
        archive << BOOST_SERIALIZATION_NVP(content);
    }
    return stream.str();
}

template <class T>
void load(const std::string& document, T& content)
{
    std::istringstream stored(document);
    boost::archive::xml_iarchive archive(stored);
    archive >> BOOST_SERIALIZATION_NVP(content);
}

/// The same for the Json archive.
template <class T>
nlohmann::json savedAsJson(const T& content)
{
    nlohmann::json root;
    Serialize::Json::oarchive(root) << BOOST_SERIALIZATION_NVP(content);
    return root;
}

template <class T>
void loadJson(const std::string& document, T& content)
{
    const auto stored = nlohmann::json::parse(document);
    Serialize::Json::iarchive archive(stored);
    archive >> BOOST_SERIALIZATION_NVP(content);
}

} // namespace GoldenTests
