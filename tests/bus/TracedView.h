// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/View.h>

#include <gmock/gmock.h>

#include <functional>
#include <map>
#include <string>
#include <vector>

namespace BusTests {

struct Note : virtual PubSub::Object
{
    explicit Note(int initial = 0) : value(initial) {}

    Note* setValue(int wanted)
    {
        value = wanted;
        return this;
    }

    int value;
};

using Lines = std::vector<std::string>;

/// Collects what happens to the views of one test, in order. An object with a name is written as "a=5", with
/// the value that it has at that moment, and any other address as the bare value.
class Trace
{
public:
    void name(const Note& note, const std::string& name) { m_names[&note] = name; }

    std::string nameOf(const Note* note) const
    {
        const auto found = m_names.find(note);
        return found == m_names.end() ? "?" : found->second;
    }

    std::string text(const Note* note) const
    {
        const std::string value = std::to_string(note->value);
        return m_names.count(note) ? nameOf(note) + "=" + value : value;
    }

    void add(const std::string& line) { m_lines.push_back(line); }

    /// What was written since the last call.
    Lines take() { return std::exchange(m_lines, Lines()); }

private:
    std::map<const Note*, std::string> m_names;
    Lines m_lines;
};

/// Writes every callback, then does what the test tells it to.
class TracedView : public Message::View<Note>
{
public:
    TracedView(Trace& trace, std::string name) : m_trace(&trace), m_name(std::move(name)) {}
    TracedView(const TracedView& other, std::string name)
        : View(other), m_trace(other.m_trace), m_name(std::move(name))
    {}

    std::function<void()> onAdded;
    std::function<void()> onChanged;
    std::function<void()> onRemoved;

protected:
    void added(const Note* note) override
    {
        write("added " + m_trace->text(note));
        call(onAdded);
    }

    void changed(const Note* note, const Note* oldValue, const Note* newValue) override
    {
        write("changed " + m_trace->nameOf(note) + ": " + m_trace->text(oldValue) + " -> " +
              m_trace->text(newValue));
    }

    void changed(const Note* note, const Note* oldValue) override
    {
        write("changed " + m_trace->nameOf(note) + ": " + m_trace->text(oldValue));
    }

    void changed(const Note* note) override
    {
        write("changed " + m_trace->text(note));
        call(onChanged);
    }

    void removed(const Note* note) override
    {
        write("removed " + m_trace->text(note));
        call(onRemoved);
    }

    void write(const std::string& line) { m_trace->add(m_name + " " + line); }

private:
    static void call(const std::function<void()>& action)
    {
        if (action) {
            action();
        }
    }

    Trace* m_trace;
    std::string m_name;
};

class ViewTest : public testing::Test
{
protected:
    ViewTest()
    {
        trace.name(a(), "a");
        trace.name(b(), "b");
    }

    /// Two objects; the address of a is the lower one.
    Note& a() { return m_notes[0]; }
    Note& b() { return m_notes[1]; }

    static Lines arrival(const std::string& view, const std::string& note, int value)
    {
        const std::string text = note + "=" + std::to_string(value);
        return {view + " added " + text, view + " changed " + note + ": 0 -> " + text,
                view + " changed " + text};
    }

    static Lines change(const std::string& view, const std::string& note, int before, int after)
    {
        const std::string text = note + "=" + std::to_string(after);
        const std::string old = view + " changed " + note + ": " + std::to_string(before);
        return {old + " -> " + text, old, view + " changed " + text};
    }

    static Lines departure(const std::string& view, const std::string& note, int value)
    {
        const std::string text = note + "=" + std::to_string(value);
        return {view + " changed " + note + ": " + text + " -> 0", view + " changed " + text,
                view + " removed " + text};
    }

    Trace trace;

private:
    Note m_notes[2];
};

inline Lines operator+(Lines first, const Lines& second)
{
    first.insert(first.end(), second.begin(), second.end());
    return first;
}

} // namespace BusTests
