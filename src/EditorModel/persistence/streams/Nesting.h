// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <functional>
#include <string>
#include <typeindex>
#include <vector>

namespace Serialize {

class ISerializable;

namespace Details {

/// Who an object is. The address alone does not tell: one that is gone may have left it to one of another
/// class.
struct Identity
{
    const void* address = nullptr;
    std::type_index type = typeid(void);

    Identity() = default;
    explicit Identity(const ISerializable* object);

    bool operator==(const Identity& other) const { return address == other.address && type == other.type; }
};

struct IdentityHash
{
    std::size_t operator()(const Identity& identity) const
    {
        return std::hash<const void*>()(identity.address) ^ identity.type.hash_code();
    }
};

/// What is open in a field stream, and so what may come next. Calls out of order throw `std::logic_error`.
class Nesting
{
public:
    void field(const char* key);
    /// The key of the value that begins.
    std::string takeKey();

    void beginClass(const std::string& name, const Identity& object);
    void endClass(const std::string& name);
    void beginSequence(int count);
    void endSequence();
    void beginItem(int index);
    void endItem(int index);

    /// True while the innermost open class is this object's: what begins then is the part of a base.
    bool isOpen(const Identity& object) const;
    /// How many classes, sequences and items are open.
    std::size_t depth() const { return m_levels.size(); }
    /// Throws unless all that was begun has ended.
    void finish() const;

private:
    enum Kind : int
    {
        Class,
        Sequence,
        Item,
    };

    struct Level
    {
        Kind kind;
        std::string name;
        Identity object;
        int count;
        int index;
    };

    void open(Level level);
    Level& top(Kind kind, const char* operation);
    void close();

    std::vector<Level> m_levels;
    std::string m_key;
    bool m_announced = false;
};

} // namespace Details
} // namespace Serialize
