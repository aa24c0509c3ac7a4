// SPDX-License-Identifier: Apache-2.0
#include "Ratio.h"

#include <EditorModel/effects/Envelope.h>
#include <EditorModel/types/Norvel.h>

#include <QTransform>

#include <algorithm>
#include <cmath>
#include <functional>
#include <random>
#include <string>
#include <vector>

namespace {

using VolumeFunction = std::function<double(qint64, qint64, qint64)>;

constexpr qint64 span = 1'000'000;

/// Times of a span in the order of playing, or in none.
std::vector<qint64> timesInOrder(bool shuffled)
{
    std::vector<qint64> times;
    for (qint64 i = 0; i < 4096; ++i) {
        times.push_back(i * span / 4096);
    }
    if (shuffled) {
        std::shuffle(times.begin(), times.end(), std::mt19937(1));
    }
    return times;
}

double keyValue(int index)
{
    return std::sin(index);
}

VolumeFunction modelFunction(int count)
{
    VolumeEnvelope envelope;
    for (int i = 0; i < count; ++i) {
        envelope.addKeyValue(double(i) / (count - 1), keyValue(i));
    }
    return Envelope::envelopeFunction(0, span, span, &envelope);
}

/// The least that gives the value: a binary search by hand over keys side by side, and a line.
class Line
{
public:
    explicit Line(int count)
    {
        for (int i = 0; i < count; ++i) {
            m_keys.push_back({double(i) / (count - 1), keyValue(i)});
        }
    }

    double operator()(qint64 current, qint64 begin, qint64 end) const
    {
        const double step = double(current - begin) / double(end - begin);
        std::size_t low = 0;
        std::size_t high = m_keys.size();
        while (low < high) {
            const std::size_t middle = (low + high) / 2;
            if (m_keys[middle].step < step) {
                low = middle + 1;
            } else {
                high = middle;
            }
        }
        if (low == 0) {
            return m_keys.front().value;
        }
        if (low == m_keys.size()) {
            return m_keys.back().value;
        }
        const Key& lower = m_keys[low - 1];
        const Key& upper = m_keys[low];
        const double t = (step - lower.step) / (upper.step - lower.step);
        return (1.0 - t) * lower.value + t * upper.value;
    }

private:
    struct Key
    {
        double step;
        double value;
    };

    std::vector<Key> m_keys;
};

VolumeFunction handWritten(int count)
{
    return Line(count);
}

void evaluate(benchmark::State& state, const VolumeFunction& function, bool shuffled)
{
    const std::vector<qint64> times = timesInOrder(shuffled);
    std::size_t i = 0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(function(times[i++ % 4096], 0, span));
    }
}

void modelAtRandom(benchmark::State& state)
{
    evaluate(state, modelFunction(int(state.range(0))), true);
}

void handAtRandom(benchmark::State& state)
{
    evaluate(state, handWritten(int(state.range(0))), true);
}

void modelInOrder(benchmark::State& state)
{
    evaluate(state, modelFunction(int(state.range(0))), false);
}

void handInOrder(benchmark::State& state)
{
    evaluate(state, handWritten(int(state.range(0))), false);
}

BENCHMARK(modelAtRandom)->Arg(2)->Arg(16)->Arg(1000);
BENCHMARK(handAtRandom)->Arg(2)->Arg(16)->Arg(1000);
BENCHMARK(modelInOrder)->Arg(2)->Arg(16)->Arg(1000);
BENCHMARK(handInOrder)->Arg(2)->Arg(16)->Arg(1000);

QTransform firstMatrix()
{
    return QTransform::fromScale(1.5, 0.75) * QTransform().rotate(20) * QTransform::fromTranslate(0.1, 0.2);
}

QTransform lastMatrix()
{
    return QTransform::fromScale(0.5, 1.25) * QTransform().rotate(110) * QTransform::fromTranslate(-0.3, 0.4);
}

Envelope::TransformationFunction turningFunction(int count)
{
    TransformationEnvelope envelope;
    for (int i = 0; i < count; ++i) {
        envelope.addKeyValue(double(i) / (count - 1),
                             {Types::Transform(i % 2 ? lastMatrix() : firstMatrix()), i % 2 ? 100 : 0});
    }
    return Envelope::envelopeFunction(0, span, span, &envelope);
}

void transformation(benchmark::State& state)
{
    const auto function = turningFunction(int(state.range(0)));
    Norvel::Proc::Matrix3x3 matrix;
    double opacity = 0.0;
    std::size_t i = 0;
    for (auto _ : state) {
        function(double(i++ % 4096) / 4096, matrix, opacity);
        benchmark::DoNotOptimize(matrix);
        benchmark::DoNotOptimize(opacity);
    }
}
BENCHMARK(transformation)->Arg(2)->Arg(16)->Arg(1000);

QTransform fresh(const Types::Transform& m)
{
    return QTransform(m.m11, m.m12, m.m13, m.m21, m.m22, m.m23, m.m31, m.m32, m.m33);
}

/// Only what Qt does for one value: taking two matrices apart and putting one together.
void matrixWork(benchmark::State& state)
{
    const Types::Transform first = firstMatrix();
    const Types::Transform last = lastMatrix();
    const QRectF unit(0, 0, 1, 1);
    for (auto _ : state) {
        const QTransform from = fresh(first);
        const QTransform to = fresh(last);
        const QPointF fromAxis = from.map(QPointF(1, 0)) - from.map(QPointF(0, 0));
        const QPointF toAxis = to.map(QPointF(1, 0)) - to.map(QPointF(0, 0));
        const double fromAngle = std::atan2(fromAxis.y(), fromAxis.x()) * 180.0 / M_PI;
        const double toAngle = std::atan2(toAxis.y(), toAxis.x()) * 180.0 / M_PI;
        const QSizeF fromScale = (from * QTransform().rotate(-fromAngle)).mapRect(unit).size();
        const QSizeF toScale = (to * QTransform().rotate(-toAngle)).mapRect(unit).size();
        const QTransform result =
            QTransform::fromScale((fromScale.width() + toScale.width()) / 2,
                                  (fromScale.height() + toScale.height()) / 2) *
            QTransform().rotate((fromAngle + toAngle) / 2) *
            QTransform::fromTranslate((from.dx() + to.dx()) / 2, (from.dy() + to.dy()) / 2);
        benchmark::DoNotOptimize(result.m11());
        benchmark::DoNotOptimize(result.m32());
    }
}
BENCHMARK(matrixWork);

bool compareAll()
{
    for (const char* count : {"2", "16", "1000"}) {
        const std::string keys = std::string(count) + " keys";
        const std::string arg = std::string("/") + count;
        Ratios::compare("volume at random times, " + keys + " : by hand", "modelAtRandom" + arg,
                        "handAtRandom" + arg, 1.5);
        Ratios::compare("volume in playing order, " + keys + " : by hand", "modelInOrder" + arg,
                        "handInOrder" + arg);
        Ratios::compare("transformation, " + keys + " : Qt's matrix work", "transformation" + arg,
                        "matrixWork");
    }
    return true;
}

const bool compared = compareAll();

} // namespace

int main(int argc, char** argv)
{
    return compared ? Ratios::run(argc, argv) : 1;
}
