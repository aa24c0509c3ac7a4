// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Serializable.h>

#include <deque>
#include <string>
#include <utility>
#include <vector>

namespace Host {

/// All that a graph of objects stores, in memory and free of any form: what one object tells of itself is a
/// node, and pointers are the numbers of nodes.
struct GraphRecord
{
    struct Value
    {
        enum Kind : int
        {
            Scalar,
            /// A pointer, or an object that is held by value.
            Reference,
            /// Keys and values: the fields of a base or of an item.
            Fields,
            /// Items, whose keys are empty.
            Sequence,
            /// The same; its order is that of addresses and means nothing.
            Unordered,
        };

        Kind kind = Scalar;
        /// Of a scalar, without loss; of fields the class, if it is that of a base.
        std::string text;
        std::size_t node = 0;
        bool byValue = false;
        std::vector<std::pair<std::string, Value>> parts;
    };

    struct Node
    {
        std::string className;
        Value fields;
    };

    std::deque<Node> nodes;
    Value roots;
};

/// Throws what an object throws that doesn't write itself.
GraphRecord recordOf(const std::deque<const Serialize::ISerializable*>& roots);

/// The text of a scalar that is not a number.
extern const char* const notANumber;

} // namespace Host
