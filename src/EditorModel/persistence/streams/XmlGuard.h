// SPDX-License-Identifier: Apache-2.0
#pragma once

class QByteArray;

namespace Serialize::Details {

/// Looks through an XML document for what makes its parser slow or large before anybody is asked: a document
/// type, with the entities that it can declare, and elements with many attributes. Throws
/// `std::runtime_error`.
void guardXml(const QByteArray& document);

} // namespace Serialize::Details
