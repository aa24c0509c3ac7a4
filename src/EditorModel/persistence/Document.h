// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/Serializable.h>

#include <QString>

#include <deque>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

class QIODevice;

/// Saving object graphs to devices and loading them back.
namespace Document {

enum Form : int
{
    Binary,
    Xml,
    Json,
};

/// Which of the two sets of conventions the document follows.
enum Route : int
{
    /// Boost's archives and the Json archive. Times are cut to 32 bits of milliseconds. Its binary and XML
    /// documents are guarded against damage, but are for files of one's own: whoever can write the guard as
    /// well can harm a reader.
    Archive,
    /// The field stream. Times are whole, and documents of any origin can be read.
    Stream,
};

/// Who may have made a document that is to be loaded.
enum Origin : int
{
    /// Oneself: every form and route is read.
    OwnDocuments,
    /// Anybody: binary and XML archives are refused, whose readers cannot withstand malice.
    ForeignDocuments,
};

/// What was wrong with a document, and where.
class EDITORMODEL_EXPORT Error : public std::runtime_error
{
public:
    /// `place` is the way of keys from the root to the field, a position in the text, or empty; so is `form`
    /// where it is not known.
    Error(const std::string& form, const std::string& place, const std::string& reason);
    ~Error() override;

    /// The form as people call it: "XML document".
    const std::string& form() const { return m_form; }
    const std::string& place() const { return m_place; }
    const std::string& reason() const { return m_reason; }

private:
    std::string m_form;
    std::string m_place;
    std::string m_reason;
};

/// Owns every object of a loaded document and frees each once, however many pointers lead to it. Pointers
/// into the graph are valid as long as it lives.
class EDITORMODEL_EXPORT Graph
{
public:
    struct Owned
    {
        void* object;
        void (*destroy)(void* object);
    };

    Graph();
    Graph(std::deque<Serialize::ISerializable*> roots, std::vector<Owned> objects); ///< takes both over
    Graph(Graph&& other) noexcept;
    Graph& operator=(Graph&& other) noexcept;
    ~Graph();

    /// The objects that were saved, in that order; null where null was saved.
    const std::deque<Serialize::ISerializable*>& roots() const { return m_roots; }

    /// The first root if it is a `T`, else null.
    template <class T>
    T* rootAs() const
    {
        return m_roots.empty() ? nullptr : dynamic_cast<T*>(m_roots.front());
    }

    /// How many objects the graph owns; shared pictures own themselves and do not count.
    std::size_t size() const { return m_objects.size(); }

private:
    std::deque<Serialize::ISerializable*> m_roots;
    std::vector<Owned> m_objects;
};

/// Writes the objects, and all that they point at, to an open device. Throws `Error`; the device may then
/// hold a part of a document.
EDITORMODEL_EXPORT void save(QIODevice& device, const std::deque<const Serialize::ISerializable*>& roots,
                             Form form, Route route = Archive);
EDITORMODEL_EXPORT void save(QIODevice& device, const Serialize::ISerializable& root, Form form,
                             Route route = Archive);

/// Reads a document up to the end of an open device; its form and route are recognised. Throws `Error`, and
/// then everything that was made is freed.
EDITORMODEL_EXPORT Graph load(QIODevice& device, Origin origin = OwnDocuments);

/// The same with files; a file is replaced as a whole or not at all. An error names the file as well.
EDITORMODEL_EXPORT void saveFile(const QString& path,
                                 const std::deque<const Serialize::ISerializable*>& roots, Form form,
                                 Route route = Archive);
EDITORMODEL_EXPORT Graph loadFile(const QString& path, Origin origin = OwnDocuments);

/// By the ending of the name, in any case: .bin, .xml, .json; none for any other.
EDITORMODEL_EXPORT std::optional<Form> formOfPath(const QString& path);

} // namespace Document
