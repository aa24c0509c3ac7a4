// SPDX-License-Identifier: Apache-2.0
#include "tests/shared/FieldTexts.h"
#include "tests/shared/VirtualSlots.h"

#include <EditorModel/media/FileAnalyzer.h>

#include <EditorModel/media/File.h>

#include <gmock/gmock.h>

#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using namespace FileAnalyzer;
using testing::ElementsAre;
using testing::IsEmpty;
using Lines = std::vector<std::string>;

static_assert(Testing::isVirtualBase<PubSub::Object, Object>);
static_assert(!std::is_base_of_v<Serialize::ISerializable, Object>);
static_assert(std::is_same_v<std::underlying_type_t<Status>, int>);
static_assert(Queued == 0 && Processing == 1 && Processed == 2 && Canceled == 3);

/// A module that writes every callback into a list, with the status that it tells of.
class Module : public FileAnalyzer::View
{
public:
    using FileAnalyzer::View::fileAnalyzer;
    using FileAnalyzer::View::fileAnalyzerAdd;
    using FileAnalyzer::View::fileAnalyzerChange;
    using FileAnalyzer::View::fileAnalyzerForget;
    using FileAnalyzer::View::fileAnalyzerIsObserved;
    using FileAnalyzer::View::fileAnalyzerIsOwned;
    using FileAnalyzer::View::fileAnalyzerObserve;
    using FileAnalyzer::View::fileAnalyzerOwn;
    using FileAnalyzer::View::fileAnalyzerOwnerPointer;
    using FileAnalyzer::View::fileAnalyzerRemove;
    using FileAnalyzer::View::fileAnalyzers;

    Lines take() { return std::exchange(m_lines, {}); }

protected:
    void fileAnalyzerAdded(const Object* object) override { write("added", object->status); }
    void fileAnalyzerRemoved(const Object* object) override { write("removed", object->status); }
    void fileAnalyzerChanged(const Object* object, const Object* oldValue, const Object* newValue) override
    {
        m_lines.push_back("changed " + std::to_string(oldValue->status) + " to " +
                          std::to_string(newValue->status));
        FileAnalyzer::View::fileAnalyzerChanged(object, oldValue, newValue);
    }
    void fileAnalyzerChanged(const Object*, const Object* oldValue) override
    {
        write("changed from", oldValue->status);
    }
    void fileAnalyzerChanged(const Object* object) override { write("changed now", object->status); }
    void statusChanged(const Object* object, Status oldStatus) override
    {
        m_lines.push_back("status " + std::to_string(oldStatus) + ", now " + std::to_string(object->status));
    }
    void cancelled(const Object* object) override { write("cancelled", object->status); }
    void processed(const Object* object) override { write("processed", object->status); }

private:
    void write(const std::string& what, Status status)
    {
        m_lines.push_back(what + " " + std::to_string(status));
    }

    Lines m_lines;
};

TEST(FileAnalyzer, IsQueuedAtFirst)
{
    const Object object;
    EXPECT_TRUE(object.queued());
    EXPECT_FALSE(object.processing());
    EXPECT_FALSE(object.processed());
    EXPECT_FALSE(object.canceled());
}

TEST(FileAnalyzer, AnswersForEachStatus)
{
    Object object;
    for (const Status status : {Queued, Processing, Processed, Canceled, static_cast<Status>(4)}) {
        SCOPED_TRACE(status);
        object.setStatus(status);
        EXPECT_EQ(object.queued(), status == 0);
        EXPECT_EQ(object.processing(), status == 1);
        EXPECT_EQ(object.processed(), status == 2);
        EXPECT_EQ(object.canceled(), status == 3);
    }
}

TEST(FileAnalyzer, CancelsFromAnyStatusAndTouchesNothingElse)
{
    const Media::File file;
    for (const Status status : {Queued, Processing, Processed, Canceled}) {
        Object object;
        object.setFiles({"/a.mp4"})->setStatus(status)->setOpened({&file})->setFailed({&file});
        EXPECT_EQ(object.cancel(), &object);
        EXPECT_EQ(object.status, Canceled);
        EXPECT_THAT(object.files, ElementsAre("/a.mp4"));
        EXPECT_THAT(object.opened, ElementsAre(&file));
        EXPECT_THAT(object.failed, ElementsAre(&file));
    }
}

/// What a change of status calls, between the three-pointer callback and the others.
Lines statusLines(int before, int after, int now)
{
    if (before == after)
        return {};
    Lines lines{"status " + std::to_string(before) + ", now " + std::to_string(now)};
    if (after == 3)
        lines.push_back("cancelled " + std::to_string(now));
    if (after == 2)
        lines.push_back("processed " + std::to_string(now));
    return lines;
}

Lines joined(std::initializer_list<Lines> parts)
{
    Lines all;
    for (const Lines& part : parts)
        all.insert(all.end(), part.begin(), part.end());
    return all;
}

TEST(FileAnalyzerView, TellsOfEveryChangeOfStatusOnArrivalChangeAndDeparture)
{
    for (int before = 0; before != 5; ++before) {
        for (int after = 0; after != 5; ++after) {
            SCOPED_TRACE(std::to_string(before) + " to " + std::to_string(after));
            const std::string from = std::to_string(before);
            const std::string to = std::to_string(after);
            Object object;
            object.setStatus(static_cast<Status>(before));
            Module owner;
            Module observer;

            const Lines arrival = joined({{"added " + from, "changed 0 to " + from},
                                          statusLines(0, before, before),
                                          {"changed now " + from}});
            owner.fileAnalyzerOwn(&object);
            EXPECT_EQ(owner.take(), arrival);
            observer.fileAnalyzerObserve(&object);
            EXPECT_EQ(observer.take(), arrival);

            observer.fileAnalyzerChange(&object)->setStatus(static_cast<Status>(after));
            const Lines change = joined({{"changed " + from + " to " + to},
                                         statusLines(before, after, after),
                                         {"changed from " + from, "changed now " + to}});
            EXPECT_EQ(owner.take(), change);
            EXPECT_EQ(observer.take(), change);

            observer.fileAnalyzerRemove(&object);
            const Lines departure = joined({{"changed " + to + " to 0"},
                                            statusLines(after, 0, after),
                                            {"changed now " + to, "removed " + to}});
            EXPECT_EQ(owner.take(), departure);
            EXPECT_EQ(observer.take(), departure);
        }
    }
}

TEST(FileAnalyzerView, FromProcessingToCanceledCallsCancelledAndNotProcessed)
{
    Object object;
    object.setStatus(Processing);
    Module module;
    module.fileAnalyzerOwn(&object);
    module.take();
    module.fileAnalyzerChange(&object)->cancel();
    EXPECT_THAT(module.take(), ElementsAre("changed 1 to 3", "status 1, now 3", "cancelled 3",
                                           "changed from 1", "changed now 3"));
}

TEST(FileAnalyzerView, ChangesOfFilesAloneCallNoneOfTheThree)
{
    const Media::File file;
    Object object;
    object.setStatus(Processed);
    Module module;
    module.fileAnalyzerOwn(&object);
    module.take();
    module.fileAnalyzerChange(&object)->setOpened({&file});
    EXPECT_THAT(module.take(), ElementsAre("changed 2 to 2", "changed from 2", "changed now 2"));
    EXPECT_THAT(object.opened, ElementsAre(&file));
    module.fileAnalyzerChange(&object)->setFailed({&file})->setFiles({"/a.mp4"});
    EXPECT_THAT(module.take(), ElementsAre("changed 2 to 2", "changed from 2", "changed now 2"));
    EXPECT_THAT(object.failed, ElementsAre(&file));
    EXPECT_THAT(object.files, ElementsAre("/a.mp4"));
}

/// Marks a job as processed as soon as it hears that it is canceled.
class Finisher : public FileAnalyzer::View
{
public:
    using FileAnalyzer::View::fileAnalyzerChange;
    using FileAnalyzer::View::fileAnalyzerOwn;

    std::vector<int> ends;

protected:
    void statusChanged(const Object* object, Status oldStatus) override
    {
        if (oldStatus == Processing && object->canceled())
            fileAnalyzerChange(object)->setStatus(Processed);
    }
    void cancelled(const Object*) override { ends.push_back(Canceled); }
    void processed(const Object*) override { ends.push_back(Processed); }
};

TEST(FileAnalyzerView, EachChangeIsToldOnceWhenAnotherOneIsMadeMeanwhile)
{
    Object object;
    object.setStatus(Processing);
    Finisher module;
    module.fileAnalyzerOwn(&object);
    module.fileAnalyzerChange(&object)->cancel();
    EXPECT_THAT(module.ends, ElementsAre(Processed, Canceled));
    EXPECT_TRUE(object.processed());
}

TEST(FileAnalyzerView, HasTheOperationsOfAViewUnderItsPrefix)
{
    Object object;
    Module owner;
    Module observer;
    EXPECT_EQ(owner.fileAnalyzer(), nullptr);
    owner.fileAnalyzerOwn(&object);
    observer.fileAnalyzerObserve(&object);
    EXPECT_EQ(owner.fileAnalyzer(), &object);
    EXPECT_THAT(observer.fileAnalyzers(), ElementsAre(&object));
    EXPECT_TRUE(owner.fileAnalyzerIsOwned(&object));
    EXPECT_FALSE(observer.fileAnalyzerIsOwned(&object));
    EXPECT_TRUE(observer.fileAnalyzerIsObserved(&object));
    EXPECT_EQ(owner.fileAnalyzerOwnerPointer(&object), &object);
    EXPECT_EQ(observer.fileAnalyzerOwnerPointer(&object), nullptr);
    observer.fileAnalyzerForget(&object);
    EXPECT_THAT(observer.fileAnalyzers(), IsEmpty());
}

#if defined(__GXX_ABI_VERSION)

/// Behind the five of a typed view, of which the first is in slot 10: status, cancelled, processed.
TEST(FileAnalyzerView, ItsVirtualFunctionsKeepTheirPlaces)
{
    using Testing::callSlot;
    Object object;
    object.setStatus(Processed);
    const Object before;
    const auto* const constObject = &object;
    Module module;
    FileAnalyzer::View* const view = &module;
    callSlot<void>(view, 10, constObject);
    callSlot<void>(view, 15, constObject, Processing);
    callSlot<void>(view, 16, constObject);
    callSlot<void>(view, 17, constObject);
    EXPECT_EQ(module.take(), Lines({"added 2", "status 1, now 2", "cancelled 2", "processed 2"}));
    // The replaced callback stands where every typed view has it.
    callSlot<void>(view, 12, constObject, &before, constObject);
    EXPECT_EQ(module.take(), Lines({"changed 0 to 2", "status 0, now 2", "processed 2"}));
}

#endif

} // namespace
