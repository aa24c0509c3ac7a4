// SPDX-License-Identifier: Apache-2.0
#include "host/project/GraphComparison.h"

#include <QtGlobal>

#include <algorithm>
#include <functional>
#include <map>
#include <sstream>
#include <vector>

namespace Host {
namespace {

using Value = GraphRecord::Value;

constexpr int mostTies = 100;

quint64 mixed(quint64 a, quint64 b)
{
    // The finisher of SplitMix64, by Sebastiano Vigna.
    quint64 z = a * 0x9e3779b97f4a7c15u + b + 0x632be59bd9b4e019u;
    z = (z ^ (z >> 30)) * 0xbf58476d1ce4e5b9u;
    z = (z ^ (z >> 27)) * 0x94d049bb133111ebu;
    return z ^ (z >> 31);
}

quint64 hashOf(const std::string& text)
{
    return std::hash<std::string>()(text);
}

/// Colours the objects so that those of one colour cannot be told apart, by what they hold and by what leads
/// to them; objects that are left in one colour are equal in every way, and one of them is picked out.
class Colouring
{
public:
    explicit Colouring(const GraphRecord& record)
        : m_record(record), m_colours(record.nodes.size()), m_marks(record.nodes.size())
    {
        refine();
        for (int ties = 0; ties != mostTies && pickOne(); ++ties) {
            refine();
        }
    }

    /// Of a value, with the colours of what it leads to.
    quint64 of(const Value& value) const
    {
        quint64 hash = mixed(quint64(value.kind), hashOf(value.text));
        if (value.kind == Value::Reference) {
            return mixed(hash, m_colours[value.node] + (value.byValue ? 1 : 0));
        }
        quint64 sum = 0;
        for (const auto& [key, part] : value.parts) {
            const quint64 partHash = mixed(hashOf(key), of(part));
            sum += mixed(partHash, 1);
            hash = value.kind == Value::Unordered ? hash : mixed(hash, partHash);
        }
        return value.kind == Value::Unordered ? mixed(hash, sum) : hash;
    }

private:
    /// Until a round tells no more objects apart.
    void refine()
    {
        for (std::size_t classes = 0;;) {
            round();
            std::vector<quint64> sorted = m_colours;
            std::sort(sorted.begin(), sorted.end());
            const auto found = std::size_t(std::unique(sorted.begin(), sorted.end()) - sorted.begin());
            if (found <= classes || found == m_colours.size()) {
                return;
            }
            classes = found;
        }
    }

    void round()
    {
        std::vector<quint64> arriving(m_colours.size());
        arrive(m_record.roots, 0, arriving);
        for (std::size_t node = 0; node != m_colours.size(); ++node) {
            arrive(m_record.nodes[node].fields, m_colours[node], arriving);
        }
        std::vector<quint64> next(m_colours.size());
        for (std::size_t node = 0; node != m_colours.size(); ++node) {
            const GraphRecord::Node& object = m_record.nodes[node];
            // What was told apart stays apart.
            next[node] = mixed(mixed(m_colours[node], m_marks[node]),
                               mixed(hashOf(object.className) + arriving[node], of(object.fields)));
        }
        m_colours = std::move(next);
    }

    /// Tells each object by which ways it is reached.
    void arrive(const Value& value, quint64 way, std::vector<quint64>& arriving) const
    {
        if (value.kind == Value::Reference) {
            arriving[value.node] += mixed(way, value.byValue ? 2 : 1);
        }
        quint64 index = 0;
        for (const auto& [key, part] : value.parts) {
            const quint64 place = value.kind == Value::Unordered ? of(part) : mixed(hashOf(key), ++index);
            arrive(part, mixed(way, place), arriving);
        }
    }

    bool pickOne()
    {
        std::map<quint64, std::vector<std::size_t>> classes;
        for (std::size_t node = 0; node != m_colours.size(); ++node) {
            classes[m_colours[node]].push_back(node);
        }
        for (const auto& entry : classes) {
            if (entry.second.size() > 1) {
                m_marks[entry.second.front()] = ++m_picked;
                return true;
            }
        }
        return false;
    }

    const GraphRecord& m_record;
    std::vector<quint64> m_colours;
    std::vector<quint64> m_marks;
    quint64 m_picked = 0;
};

class Writer
{
public:
    explicit Writer(const GraphRecord& record)
        : m_record(record), m_colours(record), m_numbers(record.nodes.size())
    {}

    std::string write()
    {
        put("roots", m_record.roots);
        for (std::size_t next = 0; next != m_order.size(); ++next) {
            const GraphRecord::Node& object = m_record.nodes[m_order[next]];
            put("#" + std::to_string(next + 1) + " " + object.className, object.fields);
        }
        return std::move(m_text);
    }

private:
    void put(const std::string& place, const Value& value)
    {
        switch (value.kind) {
        case Value::Scalar:
            line(place, value.text);
            return;
        case Value::Reference:
            line(place, std::string(value.byValue ? "holds #" : "#") + std::to_string(numberOf(value.node)));
            return;
        case Value::Unordered:
            putUnordered(place, value);
            return;
        case Value::Fields:
        case Value::Sequence:
            line(place, itemsText(value));
            for (std::size_t i = 0; i != value.parts.size(); ++i) {
                const std::string& key = value.parts[i].first;
                put(place + "/" + (key.empty() ? std::to_string(i + 1) : key), value.parts[i].second);
            }
        }
    }

    void putUnordered(const std::string& place, const Value& value)
    {
        std::vector<std::pair<quint64, const Value*>> items;
        for (const auto& part : value.parts) {
            items.emplace_back(m_colours.of(part.second), &part.second);
        }
        std::stable_sort(items.begin(), items.end(),
                         [](const auto& a, const auto& b) { return a.first < b.first; });
        line(place, itemsText(value));
        for (std::size_t i = 0; i != items.size(); ++i) {
            put(place + "/" + std::to_string(i + 1), *items[i].second);
        }
    }

    static std::string itemsText(const Value& value)
    {
        const std::string what = value.text.empty() ? std::string() : value.text + " of ";
        return what + std::to_string(value.parts.size()) + (value.parts.size() == 1 ? " item" : " items");
    }

    /// In the order of first mention.
    std::size_t numberOf(std::size_t node)
    {
        if (m_numbers[node] == 0) {
            m_order.push_back(node);
            m_numbers[node] = m_order.size();
        }
        return m_numbers[node];
    }

    void line(const std::string& place, const std::string& text)
    {
        m_text += place + ": ";
        for (const char c : text) {
            // A text must not end the line.
            m_text += c == '\\' ? "\\\\" : c == '\n' ? "\\n" : std::string(1, c);
        }
        m_text += '\n';
    }

    const GraphRecord& m_record;
    const Colouring m_colours;
    std::vector<std::size_t> m_numbers;
    std::vector<std::size_t> m_order;
    std::string m_text;
};

} // namespace

std::string canonicalText(const GraphRecord& record)
{
    return Writer(record).write();
}

std::optional<std::string> firstDifference(const GraphRecord& a, const GraphRecord& b)
{
    const std::string textA = canonicalText(a);
    const std::string textB = canonicalText(b);
    if (textA == textB) {
        return std::nullopt;
    }
    std::istringstream linesA(textA);
    std::istringstream linesB(textB);
    std::string lineA;
    std::string lineB;
    do {
        lineA = lineB = "nothing";
        std::getline(linesA, lineA);
        std::getline(linesB, lineB);
    } while (lineA == lineB && (linesA || linesB));
    const std::string place = lineA.substr(0, lineA.find(": ") + 2);
    const bool isOnePlace = lineB.compare(0, place.size(), place) == 0;
    return lineA + " against " + (isOnePlace ? lineB.substr(place.size()) : lineB);
}

} // namespace Host
