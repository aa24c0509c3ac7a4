// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/analysis/Filmstrip.h>
#include <EditorModel/analysis/Thumbnail.h>
#include <EditorModel/bus/View.h>

#include <QString>

#include <deque>
#include <map>
#include <memory>
#include <optional>
#include <vector>

namespace Filmstrip {

/// The pictures of a filmstrip, from left to right; those that could not be had are without an image.
class Payload
{
public:
    std::deque<Thumbnail::Object> pictures;
};

} // namespace Filmstrip

namespace Host {

class PictureReader;

/// Where a resource is.
struct MediaPlace
{
    QString path;
    int track;
};

/// The times in the source at which a filmstrip takes its pictures, in the order in which they stand: from
/// the start of the source range on, or back from its end if it is reversed, a step apart, within the range.
/// None where the range is empty or the step isn't more than zero; of a resource that is a picture all are at
/// 0.
std::vector<MTime> picturePositions(const Filmstrip::Object& filmstrip);

/// The module that fills filmstrips: it owns every one that is added on the bus, and the thumbnails that it
/// makes of it. A filmstrip has its pictures, and is bumped, when the request to add it returns. The file of
/// the last one stays open, so that whoever asks for those of one file together, in the order of their
/// sources, is served quickest. A QGuiApplication must be there.
class FilmstripMaker : private Message::View<Filmstrip::Object>
{
public:
    /// Other resources have no pictures.
    explicit FilmstripMaker(std::map<ResourceRef, MediaPlace> places);
    FilmstripMaker(const FilmstripMaker&) = delete;
    ~FilmstripMaker() override;

    /// Why media could not be read, by their paths: one line each that completes "The file ...".
    const std::map<QString, QString>& failures() const { return m_failures; }

private:
    using FilmstripView = Message::View<Filmstrip::Object>;

    void addRequested(Filmstrip::Object* filmstrip) override;
    std::shared_ptr<Filmstrip::Payload> thumbnailsOf(const Filmstrip::Object& filmstrip);
    /// Null for what cannot be read.
    PictureReader* readerOf(const MediaPlace& place);
    void takePictures(Filmstrip::Payload& payload, const MediaPlace& place);

    const std::map<ResourceRef, MediaPlace> m_places;
    std::map<QString, QString> m_failures;
    /// Of the reader.
    std::optional<MediaPlace> m_place;
    std::unique_ptr<PictureReader> m_reader;
    std::deque<std::shared_ptr<const Filmstrip::Payload>> m_payloads;
    Message::View<Thumbnail::Object> m_thumbnails;
};

} // namespace Host
