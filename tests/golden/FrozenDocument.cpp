// SPDX-License-Identifier: Apache-2.0
#include "FrozenDocument.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <stdexcept>

namespace GoldenTests {
namespace {

const std::filesystem::path folder = GOLDEN_DOCUMENTS;

std::string folderOf(Document::Route route)
{
    return route == Document::Archive ? "archive/" : "stream/";
}

std::string endingOf(Document::Form form)
{
    return form == Document::Xml ? ".xml" : form == Document::Json ? ".json" : ".hex";
}

std::string textOf(const std::filesystem::path& path)
{
    std::ifstream file(path, std::ios::binary);
    if (!file)
        throw std::runtime_error("there is no frozen document " + path.string());
    std::ostringstream text;
    text << file.rdbuf();
    return text.str();
}

std::vector<std::string> linesOf(const std::string& text)
{
    std::vector<std::string> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);)
        lines.push_back(line);
    return lines;
}

/// The bytes of one line of a listing.
QByteArray bytesOf(const std::string& line)
{
    return QByteArray::fromHex(QByteArray::fromStdString(line.substr(0, line.find('#'))));
}

std::string lineDifference(const std::string& stored, const std::string& written)
{
    if (stored == written)
        return {};
    std::vector<std::string> there = linesOf(stored);
    std::vector<std::string> here = linesOf(written);
    const std::size_t count = std::max(there.size(), here.size());
    there.resize(count, "(nothing)");
    here.resize(count, "(nothing)");
    const auto place = std::mismatch(there.begin(), there.end(), here.begin());
    if (place.first == there.end())
        return "the ends of lines differ";
    return "line " + std::to_string(place.first - there.begin() + 1) + " holds \"" + *place.first +
           "\", and \"" + *place.second + "\" was written";
}

std::string jsonDifference(const std::string& stored, const std::string& written)
{
    const auto there = nlohmann::json::parse(stored);
    const auto here = nlohmann::json::parse(written);
    // As text, since 1 and 1.0 are the same number.
    if (there.dump() == here.dump())
        return {};
    const auto steps = nlohmann::json::diff(there, here);
    return steps.empty() ? "a whole number became a real one, or the other way round"
                         : "what is stored would have to be changed by " + steps.at(0).dump();
}

/// Where two texts part: the content of a document is looked at first, since the length and the checksum in
/// front of it change with every field.
int firstDifference(const QByteArray& stored, const QByteArray& written)
{
    constexpr int frame = 50;
    for (const int begin : {std::min({frame, stored.size(), written.size()}), 0}) {
        const auto place =
            std::mismatch(stored.begin() + begin, stored.end(), written.begin() + begin, written.end());
        if (place.first != stored.end() || place.second != written.end())
            return static_cast<int>(place.first - stored.begin());
    }
    return -1;
}

/// Names the line of the listing that the first byte belongs to.
std::string byteDifference(const std::string& listing, const QByteArray& stored, const QByteArray& written)
{
    const int offset = firstDifference(stored, written);
    if (offset < 0)
        return {};
    int end = 0;
    for (const std::string& line : linesOf(listing)) {
        const QByteArray bytes = bytesOf(line);
        end += bytes.size();
        if (offset < end) {
            const int begin = end - bytes.size();
            return "byte " + std::to_string(offset) + ": stored is \"" + line + "\", and " +
                   written.mid(begin, bytes.size()).toHex(' ').toStdString() + " was written";
        }
    }
    return "more is written than is stored";
}

} // namespace

std::string FrozenDocument::fileOf(const std::string& name, const Way& way)
{
    std::string file = name;
    for (std::size_t colons = 0; (colons = file.find("::", colons)) != std::string::npos;)
        file.replace(colons, 2, ".");
    return folderOf(way.route) + file + endingOf(way.form);
}

std::set<std::string> FrozenDocument::files()
{
    std::set<std::string> names;
    for (const Document::Route route : {Document::Archive, Document::Stream}) {
        for (const auto& entry : std::filesystem::directory_iterator(folder / folderOf(route)))
            names.insert(folderOf(route) + entry.path().filename().string());
    }
    return names;
}

std::vector<FrozenDocument> FrozenDocument::all(const Way& way)
{
    std::vector<FrozenDocument> documents;
    for (const std::string& file : files()) {
        const std::filesystem::path path = file;
        if (path.parent_path() / "" == folderOf(way.route) && path.extension() == endingOf(way.form))
            documents.push_back(FrozenDocument(way.form, file));
    }
    return documents;
}

FrozenDocument::FrozenDocument(Document::Form form_, const std::string& file)
    : form(form_), text(textOf(folder / file))
{
    if (form != Document::Binary) {
        bytes = QByteArray::fromStdString(text);
        return;
    }
    for (const std::string& line : linesOf(text))
        bytes += bytesOf(line);
}

std::string FrozenDocument::difference(const QByteArray& written) const
{
    switch (form) {
    case Document::Binary:
        return byteDifference(text, bytes, written);
    case Document::Xml:
        return lineDifference(text, written.toStdString());
    case Document::Json:
        return jsonDifference(text, written.toStdString());
    }
    return "a form that nobody knows";
}

} // namespace GoldenTests
