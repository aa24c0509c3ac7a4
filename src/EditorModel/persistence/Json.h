// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/persistence/detail/FieldArchive.h>

#include <nlohmann/json.hpp>

#include <memory>
#include <optional>
#include <string>

/// The Json archives: a tree of values, with the classes and identities of objects in a meta node.
namespace Serialize::Json {

/// Keys of stored data.
namespace MetaDetails {
/// The meta node, in the node of an object.
EDITORMODEL_EXPORT extern const std::string s_meta;
/// The archive name of the object's class.
EDITORMODEL_EXPORT extern const std::string s_class_name;
/// The identity of an object, a number, in the node that it stands in.
EDITORMODEL_EXPORT extern const std::string s_id;
/// The identity of an object that stands elsewhere.
EDITORMODEL_EXPORT extern const std::string s_reference;
} // namespace MetaDetails

/// The identity that a node's meta node gives, if it does: that of the object in it or of one that it
/// mentions.
EDITORMODEL_EXPORT std::optional<std::size_t> getObjectId(const nlohmann::json& node);

namespace detail {

/// Text must be UTF-8. Infinities and not-a-numbers, which Json has no numbers for, go as the texts "inf",
/// "-inf" and "nan".
EDITORMODEL_EXPORT void save(nlohmann::json& node, const std::string& value);
EDITORMODEL_EXPORT void save(nlohmann::json& node, bool value);
EDITORMODEL_EXPORT void save(nlohmann::json& node, double value);
EDITORMODEL_EXPORT void save(nlohmann::json& node, int value);
EDITORMODEL_EXPORT void save(nlohmann::json& node, unsigned int value);
EDITORMODEL_EXPORT void save(nlohmann::json& node, qint64 value);

/// Throw for a node of another kind, and for a number that the type cannot hold.
EDITORMODEL_EXPORT void load(const nlohmann::json& node, std::string& value);
EDITORMODEL_EXPORT void load(const nlohmann::json& node, bool& value);
EDITORMODEL_EXPORT void load(const nlohmann::json& node, double& value);
EDITORMODEL_EXPORT void load(const nlohmann::json& node, int& value);
EDITORMODEL_EXPORT void load(const nlohmann::json& node, unsigned int& value);
EDITORMODEL_EXPORT void load(const nlohmann::json& node, qint64& value);

} // namespace detail

/// Throws `boost::archive::archive_exception` for a pointer to an object whose class is not registered, and
/// `std::runtime_error` for what cannot be written.
class EDITORMODEL_EXPORT oarchive : public Details::FieldArchive<oarchive, true>
{
public:
    /// `root` is complete when the archive ends, and lives longer.
    explicit oarchive(nlohmann::json& root);
    ~oarchive();
    oarchive(const oarchive&) = delete;
    oarchive& operator=(const oarchive&) = delete;

    template <class T>
    oarchive& operator<<(const T& value)
    {
        return *this & value;
    }

    /// The node that a value is being written into.
    nlohmann::json& headRef();
    /// Base64: the head itself where nothing stands there, else its member "bytes".
    void save_binary(const void* address, std::size_t count);

private:
    friend class Details::FieldArchive<oarchive, true>;
    friend void Details::archiveFields(oarchive& archive, const Type& type, void* object);
    class Writer;

    Fields& fields();
    void begin(const char* key);
    void end(const char* key);
    void abandon(const char* key);
    void checkCount(std::size_t) const {}
    void number(qint64& value);
    void number(double& value);

    std::unique_ptr<Writer> m_writer;
};

/// Throws `boost::archive::archive_exception` for a class that is not registered, `std::out_of_range` for an
/// identity that no object has, `std::bad_cast` for an object of another class than the pointer's, and
/// `std::runtime_error` for what else is wrong with the tree. What it makes is the caller's; what no pointer
/// names yet when it throws is freed by Document::load() alone.
class EDITORMODEL_EXPORT iarchive : public Details::FieldArchive<iarchive, false>
{
public:
    /// Reads a tree that outlives the archive.
    explicit iarchive(const nlohmann::json& root);
    ~iarchive();
    iarchive(const iarchive&) = delete;
    iarchive& operator=(const iarchive&) = delete;

    template <class T>
    iarchive& operator>>(T& value)
    {
        return *this & value;
    }
    template <class T>
    iarchive& operator>>(const boost::serialization::nvp<T>& value)
    {
        return *this & value;
    }

    /// The node that a value is being read from.
    const nlohmann::json& headRef() const;
    /// Throws unless exactly `count` bytes are stored.
    void load_binary(void* address, std::size_t count);

private:
    friend class Details::FieldArchive<iarchive, false>;
    friend void Details::archiveFields(iarchive& archive, const Type& type, void* object);
    class Reader;

    Fields& fields();
    void begin(const char* key);
    void end(const char* key);
    void abandon(const char* key);
    void checkCount(std::size_t count) const;
    void number(qint64& value);
    void number(double& value);

    std::unique_ptr<Reader> m_reader;
};

} // namespace Serialize::Json
