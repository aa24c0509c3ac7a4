// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

#include <string>
#include <vector>

namespace Serialize {

class ISerializable;
struct Type;

namespace Details {

/// Owns every object that a load makes until the load has succeeded: archives themselves free only what they
/// finished. The innermost log of a thread takes what is made on it; without one nothing is noted, and
/// objects belong to whoever reads them.
class EDITORMODEL_EXPORT ConstructionLog
{
public:
    struct Made
    {
        /// What `destroy` takes: not always the address of the complete object.
        void* object;
        void (*destroy)(void* object);
    };

    ConstructionLog();
    ~ConstructionLog();
    ConstructionLog(const ConstructionLog&) = delete;
    ConstructionLog& operator=(const ConstructionLog&) = delete;

    /// Makes an object of a type and notes it in the current log.
    static void* make(const Type& type);
    /// The same by registered name, for classes that have a creator and perhaps no type. Throws
    /// `boost::archive::archive_exception` for a name that is not registered.
    static ISerializable* makeNamed(const std::string& name);
    /// Takes an object that was made of a type out of the current log: somebody else owns it.
    static void release(void* object);

    std::size_t size() const { return m_made.size(); }
    /// Everything noted, in the order of making; the log is empty afterwards.
    std::vector<Made> take();

private:
    template <class Create>
    static auto noted(void (*destroy)(void* object), Create create) -> decltype(create());

    std::vector<Made> m_made;
    ConstructionLog* m_outer;
};

/// Frees in reverse order of making.
EDITORMODEL_EXPORT void destroyAll(std::vector<ConstructionLog::Made>& made) noexcept;

} // namespace Details
} // namespace Serialize
