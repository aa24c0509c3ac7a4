// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <boost/archive/archive_exception.hpp>

namespace Serialize::Details {

/// What every form throws for an object whose class has no registered name, and for a name that has no class.
[[noreturn]] inline void throwUnregistered()
{
    throw boost::archive::archive_exception(boost::archive::archive_exception::unregistered_class,
                                            "derived class not registered or exported");
}

} // namespace Serialize::Details
