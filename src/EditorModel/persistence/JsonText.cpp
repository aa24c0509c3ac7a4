// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/JsonText.h>

#include <stdexcept>

namespace Document::Details {
namespace {

/// Hears the parts of a document as they are parsed, and stops the parser by its answers.
class RouteFinder final : public nlohmann::json_sax<nlohmann::json>
{
public:
    explicit RouteFinder(const char* key) : m_key(key) {}

    const std::string& route() const { return m_route; }

    bool null() override { return isSearching(); }
    bool boolean(bool) override { return isSearching(); }
    bool number_integer(number_integer_t) override { return isSearching(); }
    bool number_unsigned(number_unsigned_t) override { return isSearching(); }
    bool number_float(number_float_t, const string_t&) override { return isSearching(); }
    bool binary(binary_t&) override { return isSearching(); }

    bool string(string_t& value) override
    {
        if (m_isUnderKey)
            m_route = value;
        return isSearching();
    }

    bool key(string_t& name) override
    {
        m_isUnderKey = m_depth == 1 && name == m_key;
        return true;
    }

    bool start_object(std::size_t) override
    {
        ++m_depth;
        return isSearching();
    }
    bool end_object() override { return --m_depth > 0; }
    bool start_array(std::size_t size) override { return start_object(size); }
    bool end_array() override { return end_object(); }

    bool parse_error(std::size_t, const std::string&, const nlohmann::detail::exception&) override
    {
        return false;
    }

private:
    bool isSearching() const { return !m_isUnderKey; }

    const char* const m_key;
    std::string m_route;
    int m_depth = 0;
    bool m_isUnderKey = false;
};

/// Of a byte that is counted from 1.
std::string placeOf(const QByteArray& document, std::size_t byte)
{
    const QByteArray before = document.left(static_cast<int>(byte) - 1);
    return "line " + std::to_string(before.count('\n') + 1) + ", column " +
           std::to_string(before.size() - before.lastIndexOf('\n'));
}

} // namespace

nlohmann::json parsedJson(const QByteArray& document)
{
    try {
        return nlohmann::json::parse(document.begin(), document.end());
    } catch (const nlohmann::json::parse_error& error) {
        throw std::runtime_error("this is no Json: it cannot be read on from " +
                                 placeOf(document, error.byte));
    } catch (const nlohmann::json::exception& error) {
        throw std::runtime_error(std::string("this is no Json: ") + error.what());
    }
}

std::string jsonRoute(const QByteArray& document, const char* key)
{
    RouteFinder finder(key);
    nlohmann::json::sax_parse(document.begin(), document.end(), &finder);
    return finder.route();
}

} // namespace Document::Details
