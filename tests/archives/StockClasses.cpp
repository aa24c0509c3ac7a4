// SPDX-License-Identifier: Apache-2.0
#include "tests/archives/StockClasses.h"

BOOST_CLASS_EXPORT_IMPLEMENT(Stock::Leaf)
BOOST_CLASS_EXPORT_IMPLEMENT(Stock::Trunk)
BOOST_CLASS_EXPORT_IMPLEMENT(Stock::Bark)
BOOST_CLASS_EXPORT_IMPLEMENT(Stock::Tree)
BOOST_CLASS_EXPORT_IMPLEMENT(Stock::Grove)

namespace {

/// No field list of these classes names the root as a base.
[[maybe_unused]] const bool castsToRoot = [] {
    using boost::serialization::void_cast_register;
    void_cast_register<Stock::Leaf, Stock::Root>();
    void_cast_register<Stock::Trunk, Stock::Root>();
    void_cast_register<Stock::Bark, Stock::Root>();
    void_cast_register<Stock::Tree, Stock::Root>();
    return true;
}();

} // namespace
