// SPDX-License-Identifier: Apache-2.0
#include "Ratio.h"

#include <EditorModel/bus/View.h>
#include <EditorModel/services/Task.h>

#include <QObject>

#include <deque>
#include <memory>

// The floor of the bus is what Qt offers for the same job: a signal with direct connections to slots of as
// many receivers.

class Bell : public QObject
{
    Q_OBJECT

public:
Q_SIGNALS:
    void rung(const Bell* bell);
};

class Ear : public QObject
{
    Q_OBJECT

public Q_SLOTS:
    void hear(const Bell* bell)
    {
        benchmark::DoNotOptimize(bell);
        ++heard;
    }

public:
    int heard = 0;
};

namespace {

struct Lamp : virtual PubSub::Object
{};

struct Lit : PubSub::Message<Lamp>
{
    using Message::Message;
};

struct Dimmed : PubSub::Message<Lamp>
{
    using Message::Message;
};

struct Broken : PubSub::Message<Lamp>
{
    using Message::Message;
};

class LampWatcher : public PubSub::Subscriber<Lit>
{
public:
    void notify(const Lit& message) override
    {
        benchmark::DoNotOptimize(message.sender);
        ++heard;
    }

    int heard = 0;
};

class WideWatcher : public PubSub::Subscriber<Lit, Dimmed, Broken>
{
public:
    void notify(const Lit&) override {}
    void notify(const Dimmed&) override {}
    void notify(const Broken&) override {}
};

void publish(benchmark::State& state)
{
    Lamp lamp;
    std::deque<LampWatcher> watchers(std::size_t(state.range(0)));
    for (LampWatcher& watcher : watchers) {
        watcher.subscribe(&lamp);
    }
    for (auto _ : state) {
        PubSub::publish(Lit(&lamp));
    }
}
BENCHMARK(publish)->Arg(0)->Arg(1)->Arg(10)->Arg(100);

void signal(benchmark::State& state)
{
    Bell bell;
    std::deque<Ear> ears(std::size_t(state.range(0)));
    for (Ear& ear : ears) {
        QObject::connect(&bell, &Bell::rung, &ear, &Ear::hear, Qt::DirectConnection);
    }
    for (auto _ : state) {
        Q_EMIT bell.rung(&bell);
    }
}
BENCHMARK(signal)->Arg(0)->Arg(1)->Arg(10)->Arg(100);

/// The same virtual calls without a bus, from an array.
void call(benchmark::State& state)
{
    Lamp lamp;
    std::deque<LampWatcher> watchers(std::size_t(state.range(0)));
    std::vector<PubSub::Details::Subscriber<Lit>*> receivers;
    for (LampWatcher& watcher : watchers) {
        receivers.push_back(&watcher);
    }
    for (auto _ : state) {
        const Lit message(&lamp);
        benchmark::DoNotOptimize(receivers.data());
        for (auto* receiver : receivers) {
            receiver->notify(message);
        }
    }
}
BENCHMARK(call)->Arg(1)->Arg(10)->Arg(100);

// Views of other objects must cost a publication nothing.

class LampView : public Message::View<Lamp>
{
protected:
    using View::changed;
    void changed(const Lamp* lamp) override
    {
        benchmark::DoNotOptimize(lamp);
        benchmark::DoNotOptimize(++m_heard);
    }

private:
    int m_heard = 0;
};

/// As many views as the benchmark's argument says, each of an object of its own.
class Crowd
{
public:
    explicit Crowd(std::size_t size) : m_lamps(size), m_views(size)
    {
        for (std::size_t i = 0; i != size; ++i) {
            m_views[i].observe(&m_lamps[i]);
        }
    }

private:
    std::deque<Lamp> m_lamps;
    std::deque<LampView> m_views;
};

void publishAmongViews(benchmark::State& state)
{
    const Crowd crowd(std::size_t(state.range(0)));
    Lamp lamp;
    std::deque<LampView> observers(std::size_t(state.range(1)));
    for (LampView& observer : observers) {
        observer.observe(&lamp);
    }
    for (auto _ : state) {
        PubSub::publish(Message::Types::Changed<Lamp>(&lamp, &lamp));
    }
}
BENCHMARK(publishAmongViews)->ArgsProduct({{0, 100'000}, {1, 10}});

// Coming and going

void subscribe(benchmark::State& state)
{
    std::deque<Lamp> lamps(std::size_t(state.range(0)));
    std::deque<LampWatcher> others(std::size_t(state.range(0)));
    for (std::size_t i = 0; i != others.size(); ++i) {
        others[i].subscribe(&lamps[i]);
    }
    Lamp lamp;
    LampWatcher watcher;
    for (auto _ : state) {
        watcher.subscribe(&lamp);
        watcher.unsubscribe(&lamp);
    }
}
BENCHMARK(subscribe)->Arg(0)->Arg(1'000)->Arg(100'000);

/// All are subscribers of one object.
void subscribeToOne(benchmark::State& state)
{
    Lamp lamp;
    std::deque<LampWatcher> others(std::size_t(state.range(0)));
    for (LampWatcher& other : others) {
        other.subscribe(&lamp);
    }
    LampWatcher watcher;
    for (auto _ : state) {
        watcher.subscribe(&lamp);
        watcher.unsubscribe(&lamp);
    }
}
BENCHMARK(subscribeToOne)->Arg(1'000)->Arg(100'000);

void subscribeToThreeMessages(benchmark::State& state)
{
    Lamp lamp;
    WideWatcher watcher;
    for (auto _ : state) {
        watcher.subscribe(&lamp);
        watcher.unsubscribe(&lamp);
    }
}
BENCHMARK(subscribeToThreeMessages);

void connect(benchmark::State& state)
{
    Bell bell;
    Ear ear;
    for (auto _ : state) {
        const auto connection = QObject::connect(&bell, &Bell::rung, &ear, &Ear::hear, Qt::DirectConnection);
        QObject::disconnect(connection);
    }
}
BENCHMARK(connect);

// A change of an owned object with one observer elsewhere

class TaskObserver : public Message::View<Task::Object>
{
protected:
    using View::changed;
    void changed(const Task::Object* task) override { benchmark::DoNotOptimize(task->progress); }
};

void changeTask(benchmark::State& state)
{
    Task::Object task;
    TaskObserver owner, observer;
    owner.own(&task);
    observer.observe(&task);
    double progress = 0.0;
    for (auto _ : state) {
        owner.change(&task)->setProgress(progress += 0.001);
    }
}
BENCHMARK(changeTask);

class Callback
{
public:
    virtual ~Callback() = default;
    virtual void changed(const Task::Object* task) { benchmark::DoNotOptimize(task->progress); }
};

void assignTask(benchmark::State& state)
{
    Task::Object task, wanted;
    const std::unique_ptr<Callback> owner = std::make_unique<Callback>(),
                                    observer = std::make_unique<Callback>();
    Callback* callbacks[] = {owner.get(), observer.get()};
    benchmark::DoNotOptimize(callbacks);
    double progress = 0.0;
    for (auto _ : state) {
        wanted.setProgress(progress += 0.001);
        task = wanted;
        callbacks[0]->changed(&task);
        callbacks[1]->changed(&task);
    }
}
BENCHMARK(assignTask);

const bool compared =
    Ratios::compare("publish() to nobody : Qt signal without slots", "publish/0", "signal/0") &&
    Ratios::compare("publish() to 1 : Qt signal", "publish/1", "signal/1", 0.25) &&
    Ratios::compare("publish() to 10 : Qt signal", "publish/10", "signal/10", 0.15) &&
    Ratios::compare("publish() to 100 : Qt signal", "publish/100", "signal/100", 0.15) &&
    Ratios::compare("publish() to 1 : virtual calls", "publish/1", "call/1") &&
    Ratios::compare("publish() to 10 : virtual calls", "publish/10", "call/10") &&
    Ratios::compare("publish() to 100 : virtual calls", "publish/100", "call/100") &&
    Ratios::compare("Qt signal to 100 : virtual calls", "signal/100", "call/100") &&
    Ratios::compare("1 observer, among 100 000 views : alone", "publishAmongViews/100000/1",
                    "publishAmongViews/0/1", 1.2) &&
    Ratios::compare("10 observers, among 100 000 views : alone", "publishAmongViews/100000/10",
                    "publishAmongViews/0/10", 1.2) &&
    Ratios::compare("subscribe and unsubscribe : connect and disconnect", "subscribe/0", "connect", 0.3) &&
    Ratios::compare("the same beside 1 000 subscribers of the type", "subscribe/1000", "connect", 0.3) &&
    Ratios::compare("the same beside 100 000 subscribers of the type", "subscribe/100000", "connect", 0.3) &&
    Ratios::compare("the same beside 1 000 subscribers of the object", "subscribeToOne/1000", "connect") &&
    Ratios::compare("the same beside 100 000 subscribers of the object", "subscribeToOne/100000",
                    "connect") &&
    Ratios::compare("three message types : one connection", "subscribeToThreeMessages", "connect") &&
    Ratios::compare("change of a task : assignment and two calls", "changeTask", "assignTask");

} // namespace

int main(int argc, char** argv)
{
    return compared ? Ratios::run(argc, argv) : 1;
}

#include "BusBenchmark.moc"
