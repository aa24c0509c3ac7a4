// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/detail/FieldArchive.h>

#include <functional>
#include <map>
#include <memory>

namespace boost::archive {

/// An output archive that writes nothing. It walks a graph as a save would, checks that every object is held
/// in exactly one way, and collects a deleter for each object on the heap, however many pointers lead to it.
///
/// Throws `std::runtime_error` where an object is held by value and by pointer, or twice by value, and
/// `archive_exception` for a class that is not registered. Pictures own themselves and are not entered.
class EDITORMODEL_EXPORT object_tracker : public Serialize::Details::FieldArchive<object_tracker, true>
{
public:
    enum Kind : int
    {
        NotSeen = 0,
        ByReference = 1,
        ByPointer = 2,
    };

    struct Record
    {
        Kind kind = NotSeen;
        /// The object has been walked to its end.
        bool saved = false;
        /// Deletes the object through its virtual destructor; empty for what no pointer claimed first.
        std::function<void()> deleter;
    };

    object_tracker();
    ~object_tracker();
    object_tracker(const object_tracker&) = delete;
    object_tracker& operator=(const object_tracker&) = delete;

    template <class T>
    object_tracker& operator<<(const T& value)
    {
        return *this & value;
    }

    void save_binary(const void*, std::size_t) {}

    /// By the address of the complete object. Null is entered where a null pointer was met.
    const std::map<const void*, Record>& records() const;

    /// Runs every deleter once; the records are empty afterwards.
    void deleteAll();

private:
    friend class Serialize::Details::FieldArchive<object_tracker, true>;
    friend void Serialize::Details::archiveFields(object_tracker& archive, const Serialize::Type& type,
                                                  void* object);
    class Walker;

    Serialize::Fields& fields();
    void begin(const char*) {}
    void end(const char*) {}
    void abandon(const char*) {}
    void checkCount(std::size_t) const {}
    void number(qint64&) {}
    void number(double&) {}

    std::unique_ptr<Walker> m_walker;
};

} // namespace boost::archive
