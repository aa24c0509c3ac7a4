// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/Views.h>

#include <string>
#include <utility>
#include <vector>

namespace MediaTests {

using Lines = std::vector<std::string>;

/// The flags of a file as "p" for opening, "o" for opened and "f" for failed.
inline std::string flags(const Media::File& file)
{
    return std::string(file.isOpening ? "p" : "-") + (file.isOpened ? "o" : "-") +
           (file.isFailed ? "f" : "-");
}

inline void setFlags(Media::File* file, const std::string& text)
{
    file->setOpening(text[0] == 'p')->setOpened(text[1] == 'o')->setFailed(text[2] == 'f');
}

/// A module that writes every callback into a list that it may share with others.
class FileModule : public Media::View<Media::File>
{
public:
    FileModule(Lines& lines, std::string name) : m_lines(&lines), m_name(std::move(name)) {}

    using Media::View<Media::File>::file;
    using Media::View<Media::File>::fileAdd;
    using Media::View<Media::File>::fileChange;
    using Media::View<Media::File>::fileClose;
    using Media::View<Media::File>::fileIsObserved;
    using Media::View<Media::File>::fileIsOwned;
    using Media::View<Media::File>::fileObserve;
    using Media::View<Media::File>::fileOpen;
    using Media::View<Media::File>::fileOwn;
    using Media::View<Media::File>::fileRemove;
    using Media::View<Media::File>::filesFailed;
    using Media::View<Media::File>::filesFiltered;
    using Media::View<Media::File>::filesOpened;
    using Media::View<Media::File>::filesOpening;

protected:
    void fileAdded(const Media::File* object) override { write("added", *object); }
    void fileRemoved(const Media::File* object) override { write("removed", *object); }
    void fileChanged(const Media::File* object, const Media::File* oldValue,
                     const Media::File* newValue) override
    {
        m_lines->push_back(m_name + ": changed " + flags(*oldValue) + " to " + flags(*newValue));
        Media::View<Media::File>::fileChanged(object, oldValue, newValue);
    }
    void fileChanged(const Media::File*, const Media::File* oldValue) override
    {
        write("changed from", *oldValue);
    }
    void fileChanged(const Media::File* object) override { write("changed to", *object); }
    void fileOpened(const Media::File* object) override { write("opened", *object); }
    void fileClosed(const Media::File* object) override { write("closed", *object); }
    void fileFailed(const Media::File* object) override { write("failed", *object); }

private:
    void write(const std::string& what, const Media::File& object)
    {
        m_lines->push_back(m_name + ": " + what + " " + flags(object));
    }

    Lines* m_lines;
    std::string m_name;
};

} // namespace MediaTests
