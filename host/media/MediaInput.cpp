// SPDX-License-Identifier: Apache-2.0
#include "host/media/MediaInput.h"

#include <EditorModel/types/AvTime.h>

#include <QFile>

#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <new>
#include <string>
#include <system_error>

extern "C" {
#include <libavcodec/packet.h>
#include <libavformat/avformat.h>
#include <libavutil/dict.h>
#include <libavutil/display.h>
#include <libavutil/error.h>
}

namespace Host {
namespace {

const std::uint8_t* displayMatrix(const AVStream& stream)
{
#if LIBAVFORMAT_VERSION_INT >= AV_VERSION_INT(60, 15, 100)
    const AVPacketSideData* const data = av_packet_side_data_get(
        stream.codecpar->coded_side_data, stream.codecpar->nb_coded_side_data, AV_PKT_DATA_DISPLAYMATRIX);
    return data ? data->data : nullptr;
#else
    return av_stream_get_side_data(&stream, AV_PKT_DATA_DISPLAYMATRIX, nullptr);
#endif
}

QString textOf(int error)
{
    char text[AV_ERROR_MAX_STRING_SIZE] = {};
    av_strerror(error, text, sizeof text);
    return QString::fromLocal8Bit(text);
}

[[noreturn]] void throwUnreadable(int systemError)
{
    throw MediaError(systemError == EACCES ? "may not be read: permission denied"
                                           : "cannot be read: " + textOf(AVERROR(systemError)));
}

struct Options
{
    AVDictionary* entries = nullptr;

    Options() = default;
    Options(const Options&) = delete;
    Options& operator=(const Options&) = delete;
    ~Options() { av_dict_free(&entries); }
};

/// Without the protocol a name such as "concat:x" would be taken for an address.
QByteArray urlOf(const QString& path)
{
    return "file:" + QFile::encodeName(path);
}

AVIOContext* openFile(const QString& path)
{
    AVIOContext* file = nullptr;
    const int error = avio_open(&file, urlOf(path).constData(), AVIO_FLAG_READ);
    if (error < 0) {
        throwUnreadable(AVUNERROR(error));
    }
    return file;
}

struct Recognition
{
    const AVInputFormat* format;
    /// The content speaks for the format, not only the name.
    bool isCertain;
};

const char* const unknownFormat = "is in no media format that is known here";

/// By the content and, if it isn't empty, the name. No format for what FFmpeg doesn't know.
Recognition guess(AVIOContext& file, const QByteArray& name)
{
    const AVInputFormat* format = nullptr;
    const int score = av_probe_input_buffer2(&file, &format, name.constData(), nullptr, 0, 0);
    if (score < 0 && score != AVERROR_INVALIDDATA && score != AVERROR_EOF) {
        throwUnreadable(AVUNERROR(score));
    }
    return {score < 0 ? nullptr : format, score > AVPROBE_SCORE_EXTENSION};
}

Recognition recognise(AVIOContext& file, const QByteArray& name)
{
    const Recognition byName = guess(file, name);
    // Any text is taken for the recording of a terminal if its name ends in .txt.
    if (!byName.format || byName.format->name == std::string("tty")) {
        throw MediaError(unknownFormat);
    }
    // The reader of picture series goes by the name first; the readers of single pictures tell what is in the
    // file.
    if ((byName.format->flags & AVFMT_NOFILE) != 0) {
        const Recognition byContent = guess(file, QByteArray());
        return byContent.format ? byContent : Recognition{byName.format, false};
    }
    return byName;
}

[[noreturn]] void throwDamaged(const Recognition& recognition, int error)
{
    const bool isContent = error == AVERROR_INVALIDDATA || error == AVERROR_EOF;
    if (isContent && !recognition.isCertain) {
        throw MediaError(unknownFormat);
    }
    const QString looks =
        QString("looks like %1 but is damaged or incomplete").arg(recognition.format->long_name);
    throw MediaError(isContent ? looks : looks + ": " + textOf(error));
}

AVFormatContext* openContext(AVIOContext& file, const Recognition& recognition, const QString& path)
{
    Options options;
    // A playlist may name other files, but must not lead out of the machine.
    av_dict_set(&options.entries, "protocol_whitelist", "file", 0);
    AVFormatContext* context = avformat_alloc_context();
    if (!context) {
        throw std::bad_alloc();
    }
    context->pb = &file;
    const int error =
        avformat_open_input(&context, urlOf(path).constData(), recognition.format, &options.entries);
    if (error < 0) {
        throwDamaged(recognition, error);
    }
    return context;
}

} // namespace

MediaError::MediaError(const QString& why) : std::runtime_error(why.toStdString()), reason(why) {}

void requireFile(const QString& path)
{
    namespace fs = std::filesystem;
    if (path.isEmpty()) {
        throw MediaError("has no name");
    }
    const fs::path file(QFile::encodeName(path).toStdString());
    std::error_code error;
    const fs::file_status status = fs::status(file, error);
    if (status.type() == fs::file_type::not_found) {
        // Bytes that are no UTF-8 have become this character, and the name leads nowhere.
        if (path.contains(QChar(QChar::ReplacementCharacter))) {
            throw MediaError("does not exist, or its name is not UTF-8");
        }
        const bool isLink = fs::is_symlink(fs::symlink_status(file, error));
        throw MediaError(isLink ? "is a link to a file that does not exist" : "does not exist");
    }
    if (error) {
        throwUnreadable(error.value());
    }
    if (fs::is_directory(status)) {
        throw MediaError("is a folder");
    }
    if (!fs::is_regular_file(status)) {
        throw MediaError("is not a regular file");
    }
    if (fs::file_size(file, error) == 0) {
        throw MediaError("is empty");
    }
}

void MediaInput::CloseFile::operator()(AVIOContext* file) const
{
    avio_closep(&file);
}

void MediaInput::CloseContext::operator()(AVFormatContext* context) const
{
    avformat_close_input(&context);
}

MediaInput::MediaInput(const QString& path)
{
    requireFile(path);
    m_file.reset(openFile(path));
    const Recognition recognition = recognise(*m_file, urlOf(path));
    m_context.reset(openContext(*m_file, recognition, path));
    const int error = avformat_find_stream_info(m_context.get(), nullptr);
    if (error < 0) {
        throwDamaged(recognition, error);
    }
}

std::size_t MediaInput::streamCount() const
{
    return m_context->nb_streams;
}

AVStream& MediaInput::stream(std::size_t index) const
{
    return *m_context->streams[index];
}

std::string MediaInput::format() const
{
    return m_context->iformat->name;
}

MTime MediaInput::length() const
{
    return m_context->duration == AV_NOPTS_VALUE ? MTime() : Types::fromAvTimeRound(m_context->duration);
}

bool MediaInput::isPictureFormat() const
{
    const std::string name = format();
    const std::string pipe = "_pipe";
    return name == "image2" ||
           (name.size() > pipe.size() && name.compare(name.size() - pipe.size(), pipe.size(), pipe) == 0);
}

bool MediaInput::reachesItsEnd()
{
    // Otherwise FFmpeg has seen the end itself, or guessed the length from the size.
    const bool lengthIsTold = m_context->duration_estimation_method == AVFMT_DURATION_FROM_STREAM;
    if (!lengthIsTold || isPictureFormat()) {
        return true;
    }
    const MTime tolerance = std::max(MTime(1000), length().divRound(10.0));
    if (length() <= tolerance) {
        return true;
    }
    const std::int64_t start = m_context->start_time == AV_NOPTS_VALUE ? 0 : m_context->start_time;
    return holdsDataFrom(start + Types::toAvTime(length() - tolerance));
}

bool MediaInput::holdsDataFrom(std::int64_t avTime)
{
    if (av_seek_frame(m_context.get(), -1, avTime, AVSEEK_FLAG_BACKWARD) < 0) {
        return true;
    }
    const std::unique_ptr<AVPacket, void (*)(AVPacket*)> packet(av_packet_alloc(),
                                                                [](AVPacket* p) { av_packet_free(&p); });
    if (!packet) {
        throw std::bad_alloc();
    }
    bool reached = false;
    while (!reached && av_read_frame(m_context.get(), packet.get()) >= 0) {
        const std::int64_t begin = packet->pts != AV_NOPTS_VALUE ? packet->pts : packet->dts;
        const AVRational unit = stream(static_cast<std::size_t>(packet->stream_index)).time_base;
        reached = begin == AV_NOPTS_VALUE ||
                  av_rescale_q(begin + packet->duration, unit, AVRational{1, AV_TIME_BASE}) >= avTime;
        av_packet_unref(packet.get());
    }
    return reached;
}

double turnOf(const AVStream& stream)
{
    const std::uint8_t* const matrix = displayMatrix(stream);
    return matrix ? av_display_rotation_get(reinterpret_cast<const std::int32_t*>(matrix)) : 0.0;
}

} // namespace Host
