// SPDX-License-Identifier: Apache-2.0
// Single values of the Json archives.
#include <EditorModel/persistence/Utf8.h>
#include <EditorModel/persistence/archives/JsonNodes.h>

#include <cmath>
#include <cstring>
#include <limits>
#include <stdexcept>

namespace Serialize::Json {

namespace MetaDetails {
const std::string s_meta = "$meta";
const std::string s_class_name = "class";
const std::string s_id = "id";
const std::string s_reference = "ref";
} // namespace MetaDetails

namespace {

/// The meta node, or null. It is looked for in every object, and nearly always stands first or not at all.
const nlohmann::json* metaOf(const nlohmann::json& node)
{
    const auto* const members = node.get_ptr<const nlohmann::json::object_t*>();
    if (!members || members->empty())
        return nullptr;
    const int order = members->begin()->first.compare(MetaDetails::s_meta);
    if (order > 0)
        return nullptr;
    const auto found = order == 0 ? members->begin() : members->find(MetaDetails::s_meta);
    return found == members->end() || !found->second.is_object() ? nullptr : &found->second;
}

} // namespace

bool sharesKey(const nlohmann::json& node, const char* key)
{
    return std::strcmp(key, "element") == 0 || (std::strcmp(key, "item") == 0 && node.contains(countKey));
}

void requireItems(const nlohmann::json& collection, std::size_t count)
{
    const auto items = collection.find(Details::itemKey.archive);
    const std::size_t stored = items == collection.end() || !items->is_array() ? 0 : items->size();
    if (count != stored)
        throw std::runtime_error("there are " + std::to_string(stored) + " items where " +
                                 std::to_string(count) + " are counted");
}

void requireByteCount(std::size_t count)
{
    if (count > static_cast<std::size_t>(std::numeric_limits<int>::max()))
        throw std::length_error(std::to_string(count) + " bytes are too many for one value");
}

std::optional<std::size_t> identityIn(const nlohmann::json& node, const std::string& key)
{
    const auto* const meta = metaOf(node);
    if (!meta)
        return std::nullopt;
    const auto id = meta->find(key);
    if (id == meta->end())
        return std::nullopt;
    if (!id->is_number_integer() || *id < 0)
        throw std::runtime_error(std::string("an identifier is ") + id->type_name() +
                                 ", not a whole number from 0 on");
    return id->get<std::size_t>();
}

std::optional<std::size_t> getObjectId(const nlohmann::json& node)
{
    const auto reference = identityIn(node, MetaDetails::s_reference);
    return reference ? reference : identityIn(node, MetaDetails::s_id);
}

namespace detail {
namespace {

constexpr const char* infinite = "inf";
constexpr const char* minusInfinite = "-inf";
constexpr const char* notANumber = "nan";

[[noreturn]] void throwOther(const char* expected, const nlohmann::json& node)
{
    throw std::runtime_error(std::string("there is ") + node.type_name() + " where " + expected +
                             " is expected");
}

template <class Number>
void loadWhole(const nlohmann::json& node, Number& value)
{
    if (!node.is_number_integer())
        throwOther("a whole number", node);
    using Limits = std::numeric_limits<Number>;
    const bool fits = node.is_number_unsigned()
                          ? node.get<std::uint64_t>() <= static_cast<std::uint64_t>(Limits::max())
                          : node.get<std::int64_t>() >= static_cast<std::int64_t>(Limits::min()) &&
                                node.get<std::int64_t>() <= static_cast<std::int64_t>(Limits::max());
    if (!fits)
        throw std::runtime_error("the number " + node.dump() + " is out of range");
    value = node.get<Number>();
}

} // namespace

void save(nlohmann::json& node, const std::string& value)
{
    Details::requireUtf8(value);
    node = value;
}

void save(nlohmann::json& node, bool value)
{
    node = value;
}

void save(nlohmann::json& node, double value)
{
    if (std::isfinite(value))
        node = value;
    else
        node = std::isnan(value) ? notANumber : value > 0 ? infinite : minusInfinite;
}

void save(nlohmann::json& node, int value)
{
    node = value;
}

void save(nlohmann::json& node, unsigned int value)
{
    node = value;
}

void save(nlohmann::json& node, qint64 value)
{
    node = value;
}

void load(const nlohmann::json& node, std::string& value)
{
    if (!node.is_string())
        throwOther("a text", node);
    value = node.get_ref<const std::string&>();
}

void load(const nlohmann::json& node, bool& value)
{
    if (!node.is_boolean())
        throwOther("a boolean", node);
    value = node.get<bool>();
}

void load(const nlohmann::json& node, double& value)
{
    if (node.is_number()) {
        value = node.get<double>();
        return;
    }
    const std::string* const text = node.get_ptr<const std::string*>();
    if (text && *text == infinite)
        value = std::numeric_limits<double>::infinity();
    else if (text && *text == minusInfinite)
        value = -std::numeric_limits<double>::infinity();
    else if (text && *text == notANumber)
        value = std::numeric_limits<double>::quiet_NaN();
    else
        throwOther("a number", node);
}

void load(const nlohmann::json& node, int& value)
{
    loadWhole(node, value);
}

void load(const nlohmann::json& node, unsigned int& value)
{
    loadWhole(node, value);
}

void load(const nlohmann::json& node, qint64& value)
{
    loadWhole(node, value);
}

} // namespace detail
} // namespace Serialize::Json
