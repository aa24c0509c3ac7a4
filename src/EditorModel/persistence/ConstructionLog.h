// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <vector>

namespace Serialize {

struct Type;

namespace Details {

/// Owns every object that a load makes until the load has succeeded: archives themselves free only what they
/// finished. The innermost log of a thread takes what is made on it; without one nothing is noted, and
/// objects belong to whoever reads them.
class ConstructionLog
{
public:
    struct Made
    {
        void* object;
        const Type* type;
    };

    ConstructionLog();
    ~ConstructionLog();
    ConstructionLog(const ConstructionLog&) = delete;
    ConstructionLog& operator=(const ConstructionLog&) = delete;

    /// Makes an object of a type and notes it in the current log.
    static void* make(const Type& type);
    /// Takes an object out of the current log: somebody else owns it.
    static void release(void* object);

    /// Everything noted, in the order of making; the log is empty afterwards.
    std::vector<Made> take();

private:
    std::vector<Made> m_made;
    ConstructionLog* m_outer;
};

/// Frees in reverse order of making.
void destroyAll(std::vector<ConstructionLog::Made>& made) noexcept;

} // namespace Details
} // namespace Serialize
