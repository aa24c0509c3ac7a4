// SPDX-License-Identifier: Apache-2.0
// Reads what the fuzzer makes up as the text of a resource. What was read is written as a text that is read
// as the same, but for an identifier with a place marker, which is filled.
#include <EditorModel/media/ResourceRef.h>

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <tuple>

namespace {

/// Writing fills "%1", "%L1" and what else QString::arg takes for a place.
bool hasPlaceMarker(const QString& text)
{
    const QString behind = text + QStringLiteral("  ");
    for (int at = behind.indexOf(QLatin1Char('%')); at >= 0; at = behind.indexOf(QLatin1Char('%'), at + 1)) {
        const int digit = behind[at + 1] == QLatin1Char('L') ? at + 2 : at + 1;
        if (behind[digit].digitValue() >= 0)
            return true;
    }
    return false;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const QString text = QString::fromUtf8(reinterpret_cast<const char*>(data), int(size));
    const ResourceRef resource = Resource::parseResource(text);
    const QString written = Resource::serializeResource(resource);
    if (hasPlaceMarker(std::get<QString>(resource)))
        return 0;
    if (Resource::parseResource(written) != resource) {
        std::fprintf(stderr, "Written: %s\n", written.toUtf8().constData());
        std::abort();
    }
    return 0;
}
