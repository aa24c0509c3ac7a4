// SPDX-License-Identifier: Apache-2.0
#pragma once

// Modules that were built apart meet in the tables of virtual functions, so that the order of these functions
// is a part of the interface.
#if defined(__GXX_ABI_VERSION)

namespace Testing {

/// Calls the virtual function in a slot of the Itanium C++ ABI's table, counted from 0; a destructor has two
/// slots. A reference is handed over as a pointer.
template <class Result, class Object, class... Arguments>
Result callSlot(Object* object, int slot, Arguments... arguments)
{
    using Function = Result (*)(Object*, Arguments...);
    return (*reinterpret_cast<Function* const*>(object))[slot](object, arguments...);
}

} // namespace Testing

#endif
