// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/types/Norvel.h>

#include <gtest/gtest.h>

#include <cstdlib>
#include <new>

namespace {
thread_local std::size_t allocations = 0;
}

// Counts the allocations of the whole program, those of the library included.
void* operator new(std::size_t size)
{
    ++allocations;
    if (void* memory = std::malloc(size ? size : 1)) {
        return memory;
    }
    throw std::bad_alloc();
}

void operator delete(void* memory) noexcept
{
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept
{
    std::free(memory);
}

namespace {

TEST(EnvelopeAllocation, BuildingAFunctionIsCounted)
{
    VolumeEnvelope envelope;
    envelope.addKeyValue(0, 1)->addKeyValue(1, 2);
    const std::size_t before = allocations;
    const auto gain = Envelope::envelopeFunction(0, 10, 10, &envelope);
    EXPECT_GT(allocations, before);
    EXPECT_EQ(gain(0, 0, 10), 1);
}

TEST(EnvelopeAllocation, CallingAVolumeFunctionAllocatesNothing)
{
    VolumeEnvelope envelope;
    for (int i = 0; i <= 1000; ++i) {
        envelope.addKeyValue(i / 1000.0, i);
    }
    const auto gain = Envelope::combine(Envelope::envelopeFunction(0, 1000, 1000, &envelope),
                                        Envelope::fadeFunction(100, 100));
    double sum = 0;
    const std::size_t before = allocations;
    for (int time = -10; time < 1010; ++time) {
        sum += gain(time, 0, 1000);
    }
    EXPECT_EQ(allocations, before);
    EXPECT_GT(sum, 0);
}

TEST(EnvelopeAllocation, CallingATransformationFunctionAllocatesNothing)
{
    TransformationEnvelope envelope;
    envelope.addKeyValue(0, {Types::Transform(), 0});
    envelope.addKeyValue(1, {Types::Transform(0, 2, 0, -2, 0, 0, 5, 6, 1), 100});
    const auto function = Envelope::envelopeFunction(0, 10, 10, &envelope);
    Norvel::Proc::Matrix3x3 matrix;
    double opacity = 0;
    double sum = 0;
    function(0.5, matrix, opacity); // what Qt makes once
    const std::size_t before = allocations;
    for (int i = -10; i <= 110; ++i) {
        function(i / 100.0, matrix, opacity);
        sum += opacity;
    }
    EXPECT_EQ(allocations, before);
    EXPECT_GT(sum, 0);
}

} // namespace
