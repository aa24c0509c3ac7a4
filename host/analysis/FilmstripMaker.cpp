// SPDX-License-Identifier: Apache-2.0
#include "host/analysis/FilmstripMaker.h"

#include "host/analysis/PictureReader.h"

#include <EditorModel/types/Image.h>

#include <QPixmap>

#include <utility>

namespace Host {

std::vector<MTime> picturePositions(const Filmstrip::Object& filmstrip)
{
    std::vector<MTime> positions;
    const Types::Range& range = filmstrip.sourceRange;
    if (filmstrip.step <= MTime()) {
        return positions;
    }
    const bool isStill = std::get<Resource::Type>(filmstrip.resource) == Resource::ImageType;
    for (MTime from = range.from; from < range.to; from += filmstrip.step) {
        // Before its end, as the end isn't shown any more.
        const MTime back = range.to - 1 - (from - range.from);
        positions.push_back(isStill ? MTime() : filmstrip.reversed ? back : from);
    }
    return positions;
}

FilmstripMaker::FilmstripMaker(std::map<ResourceRef, MediaPlace> places) : m_places(std::move(places))
{
    processAddRequests();
}

FilmstripMaker::~FilmstripMaker() = default;

void FilmstripMaker::addRequested(Filmstrip::Object* filmstrip)
{
    FilmstripView::addRequested(filmstrip);
    const auto payload = thumbnailsOf(*filmstrip);
    const auto place = m_places.find(filmstrip->resource);
    if (place != m_places.end()) {
        takePictures(*payload, place->second);
    }
    auto filled = change(filmstrip);
    filled->payload = payload;
    filled->bump();
}

std::shared_ptr<Filmstrip::Payload> FilmstripMaker::thumbnailsOf(const Filmstrip::Object& filmstrip)
{
    auto payload = std::make_shared<Filmstrip::Payload>();
    for (const MTime position : picturePositions(filmstrip)) {
        payload->pictures.emplace_back();
        m_thumbnails.own(&payload->pictures.back())
            ->setResource(filmstrip.resource)
            ->setResourceDuration(filmstrip.sourceDuration)
            ->setPosition(position)
            ->setSize(filmstrip.width, filmstrip.height);
    }
    m_payloads.push_back(payload);
    return payload;
}

PictureReader* FilmstripMaker::readerOf(const MediaPlace& place)
{
    if (!m_place || m_place->path != place.path || m_place->track != place.track) {
        m_place = place;
        m_reader.reset();
        try {
            m_reader = std::make_unique<PictureReader>(place.path, place.track);
        } catch (const MediaError& error) {
            m_failures[place.path] = error.reason;
        }
    }
    return m_reader.get();
}

void FilmstripMaker::takePictures(Filmstrip::Payload& payload, const MediaPlace& place)
{
    PictureReader* const reader = readerOf(place);
    if (!reader) {
        return;
    }
    const Thumbnail::Object* before = nullptr;
    for (const Thumbnail::Object& thumbnail : payload.pictures) {
        auto image = before && *before == thumbnail ? before->image : nullptr;
        if (!image) {
            image = std::make_shared<const Types::Image>(
                QPixmap::fromImage(reader->at(thumbnail.position, QSize(thumbnail.width, thumbnail.height))));
        }
        m_thumbnails.change(&thumbnail)->setImage(image);
        before = &thumbnail;
    }
}

} // namespace Host
