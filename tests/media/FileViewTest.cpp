// SPDX-License-Identifier: Apache-2.0
#include "FileModule.h"

#include "tests/shared/VirtualSlots.h"

#include <gmock/gmock.h>

namespace {

using namespace MediaTests;
using testing::ElementsAre;
using testing::IsEmpty;

const char* const states[] = {"---", "p--", "-o-", "po-", "--f", "p-f", "-of", "pof"};

// What a change from the state of the row to the state of the column calls, in this order: O for fileOpened,
// C for fileClosed, F for fileFailed.
const char* const calls[8][8] = {
    //           ---  p--  -o-  po-  --f   p-f   -of   pof
    /* --- */ {"", "", "O", "", "F", "F", "OF", "F"},
    /* p-- */ {"", "", "O", "", "F", "F", "OF", "F"},
    /* -o- */ {"C", "C", "", "", "CF", "CF", "F", "F"},
    /* po- */ {"C", "C", "O", "", "CF", "CF", "OF", "F"},
    /* --f */ {"", "", "O", "", "", "", "O", ""},
    /* p-f */ {"", "", "O", "", "", "", "O", ""},
    /* -of */ {"C", "C", "", "", "C", "C", "", ""},
    /* pof */ {"C", "C", "O", "", "C", "C", "O", ""},
};

Lines callLines(const std::string& name, const std::string& letters, const std::string& flagsNow)
{
    Lines lines;
    for (const char letter : letters) {
        lines.push_back(name +
                        (letter == 'O'   ? ": opened "
                         : letter == 'C' ? ": closed "
                                         : ": failed ") +
                        flagsNow);
    }
    return lines;
}

Lines joined(std::initializer_list<Lines> parts)
{
    Lines all;
    for (const Lines& part : parts) {
        all.insert(all.end(), part.begin(), part.end());
    }
    return all;
}

Lines arrival(const std::string& name, const std::string& now, const std::string& letters)
{
    return joined({{name + ": added " + now, name + ": changed --- to " + now},
                   callLines(name, letters, now),
                   {name + ": changed to " + now}});
}

Lines change(const std::string& name, const std::string& before, const std::string& now,
             const std::string& letters)
{
    return joined({{name + ": changed " + before + " to " + now},
                   callLines(name, letters, now),
                   {name + ": changed from " + before, name + ": changed to " + now}});
}

Lines departure(const std::string& name, const std::string& now, const std::string& letters)
{
    return joined({{name + ": changed " + now + " to ---"},
                   callLines(name, letters, now),
                   {name + ": changed to " + now, name + ": removed " + now}});
}

TEST(FileView, TellsOfEveryChangeOfStateOnArrivalChangeAndDeparture)
{
    for (int before = 0; before != 8; ++before) {
        for (int after = 0; after != 8; ++after) {
            SCOPED_TRACE(std::string(states[before]) + " to " + states[after]);
            Lines lines;
            Media::File file;
            setFlags(&file, states[before]);
            FileModule owner(lines, "owner");
            FileModule observer(lines, "observer");

            owner.fileOwn(&file);
            EXPECT_EQ(std::exchange(lines, {}), arrival("owner", states[before], calls[0][before]));
            observer.fileObserve(&file);
            EXPECT_EQ(std::exchange(lines, {}), arrival("observer", states[before], calls[0][before]));

            setFlags(owner.fileChange(&file).operator->(), states[after]);
            EXPECT_EQ(std::exchange(lines, {}),
                      joined({change("owner", states[before], states[after], calls[before][after]),
                              change("observer", states[before], states[after], calls[before][after])}));

            owner.fileRemove(&file);
            EXPECT_EQ(std::exchange(lines, {}), joined({departure("observer", states[after], calls[after][0]),
                                                        departure("owner", states[after], calls[after][0])}));
        }
    }
}

TEST(FileView, HearsAtOnceThatANewFileIsOpenAlready)
{
    Lines lines;
    Media::File file;
    file.setOpened(true);
    FileModule module(lines, "module");
    module.fileObserve(&file);
    EXPECT_THAT(lines, ElementsAre("module: added -o-", "module: changed --- to -o-", "module: opened -o-",
                                   "module: changed to -o-"));
}

TEST(FileView, HearsOfADepartingOpenFileThatItIsClosed)
{
    Lines lines;
    Media::File file;
    file.setOpened(true);
    FileModule module(lines, "module");
    module.fileOwn(&file);
    lines.clear();
    module.fileRemove(&file);
    EXPECT_THAT(lines, ElementsAre("module: changed -o- to ---", "module: closed -o-",
                                   "module: changed to -o-", "module: removed -o-"));
}

TEST(FileView, OpensAFileOfAnotherByAskingItsOwner)
{
    Lines lines;
    Media::File::Track::Video track;
    Media::File file;
    file.setPath("/old.mp4")->setSize(10)->setLength(MTime(5))->setOpened(true)->addTrack(&track);
    FileModule owner(lines, "owner");
    FileModule observer(lines, "observer");
    owner.fileOwn(&file);
    observer.fileObserve(&file);
    lines.clear();

    observer.fileOpen(&file, "/new.mp4");
    EXPECT_EQ(lines, joined({change("owner", "-o-", "p--", "C"), change("observer", "-o-", "p--", "C")}));
    EXPECT_EQ(file.path, "/new.mp4");
    EXPECT_EQ(file.size, 0);
    EXPECT_EQ(file.length, MTime());
    EXPECT_THAT(file.videoTracks, IsEmpty());
    EXPECT_EQ(flags(file), "p--");
}

TEST(FileView, ClosesAFileOfAnotherByAskingItsOwner)
{
    Lines lines;
    Media::File file;
    file.setPath("/old.mp4")->setOpened(true);
    FileModule owner(lines, "owner");
    FileModule observer(lines, "observer");
    owner.fileOwn(&file);
    observer.fileObserve(&file);
    lines.clear();

    observer.fileClose(&file);
    EXPECT_EQ(lines, joined({change("owner", "-o-", "---", "C"), change("observer", "-o-", "---", "C")}));
    EXPECT_EQ(file.path, "");
}

TEST(FileView, OpensAndClosesItsFirstFileWhereNoneIsNamed)
{
    Lines lines;
    Media::File files[2];
    FileModule module(lines, "module");
    module.fileOwn(&files[1]);
    module.fileOwn(&files[0]);
    module.fileOpen("/a.mp4");
    EXPECT_EQ(files[0].path, "/a.mp4");
    EXPECT_EQ(flags(files[0]), "p--");
    EXPECT_EQ(flags(files[1]), "---");
    module.fileClose();
    EXPECT_EQ(files[0].path, "");
    EXPECT_EQ(flags(files[0]), "---");
}

/// Answers adds with nothing but a note of what was to be added.
class AddListener : public PubSub::Subscriber<Message::Types::Add<Media::File>>
{
public:
    AddListener() { subscribeAll<Media::File>(); }

    void notify(const Message::Types::Add<Media::File>& message) override
    {
        added.push_back(message.object->path.toStdString() + " " + flags(*message.object));
    }

    Lines added;
};

TEST(FileView, WithNoFileAsksForAValueOfItsOwnToBeAdded)
{
    Lines lines;
    AddListener listener;
    FileModule module(lines, "module");
    module.fileOpen("/a.mp4");
    EXPECT_THAT(listener.added, ElementsAre("/a.mp4 p--"));
    module.fileOpen(nullptr, "/b.mp4");
    module.fileClose();
    module.fileClose(nullptr);
    EXPECT_THAT(listener.added, ElementsAre("/a.mp4 p--", "/b.mp4 p--", " ---", " ---"));
    EXPECT_THAT(lines, IsEmpty());
    EXPECT_EQ(module.file(), nullptr);
}

TEST(FileView, WithNoFileAndNobodyToAddItOpensNothing)
{
    Lines lines;
    FileModule module(lines, "module");
    FileModule other(lines, "other");
    module.fileOpen("/a.mp4");
    EXPECT_THAT(lines, IsEmpty());
    EXPECT_EQ(module.file(), nullptr);
}

TEST(FileView, SortsItsFilesByTheirFlags)
{
    Lines lines;
    Media::File files[8];
    FileModule module(lines, "module");
    for (int i = 0; i != 8; ++i) {
        setFlags(&files[i], states[i]);
        if (i % 2 == 0) {
            module.fileOwn(&files[i]);
        } else {
            module.fileObserve(&files[i]);
        }
    }
    EXPECT_THAT(module.filesOpening(), ElementsAre(&files[1], &files[3], &files[5], &files[7]));
    EXPECT_THAT(module.filesOpened(), ElementsAre(&files[2], &files[3], &files[6], &files[7]));
    EXPECT_THAT(module.filesFailed(), ElementsAre(&files[4], &files[5], &files[6], &files[7]));
    EXPECT_THAT(module.filesFiltered([&](const Media::File* file) { return file == &files[2]; }),
                ElementsAre(&files[2]));
    EXPECT_THAT(module.filesFiltered([](const Media::File*) { return false; }), IsEmpty());
}

#if defined(__GXX_ABI_VERSION)

/// Behind those of a typed view.
TEST(FileView, ItsVirtualFunctionsKeepTheirPlaces)
{
    Lines lines;
    const Media::File file;
    const Media::File* const object = &file;
    FileModule module(lines, "module");
    Media::View<Media::File>* const view = &module;
    for (const int slot : {10, 15, 16, 17})
        Testing::callSlot<void>(view, slot, object);
    EXPECT_THAT(lines, ElementsAre("module: added ---", "module: opened ---", "module: closed ---",
                                   "module: failed ---"));
}

#endif

} // namespace
