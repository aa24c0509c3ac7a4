// SPDX-License-Identifier: Apache-2.0
#include "CurveCommand.h"

#include "CurveSample.h"
#include "CurveText.h"
#include "MediaInput.h"
#include "Picture.h"
#include "TransformationPicture.h"
#include "VolumePicture.h"

#include <EditorModel/persistence/Document.h>

#include <memory>
#include <optional>
#include <string>

namespace Host {
namespace {

/// Why the command cannot go on: the name of a file, and a line that completes "The file ...".
struct Refusal
{
    QString name;
    QString reason;
};

void writeSample(const CurveOptions& options)
{
    const auto form = Document::formOfPath(options.document);
    if (!form) {
        throw Refusal{options.document, "is no name of a document: such a name ends in .json, .xml or .bin"};
    }
    const VolumeEnvelope volume = sampleVolumeEnvelope();
    const TransformationEnvelope transformation = sampleTransformationEnvelope();
    const Serialize::ISerializable* const root = options.sample == VolumeSample
                                                     ? static_cast<const Serialize::ISerializable*>(&volume)
                                                     : &transformation;
    Document::saveFile(options.document, {root}, *form, Document::Stream);
}

[[noreturn]] void refuseContent(const CurveOptions& options, const Document::Graph& graph)
{
    const Serialize::ISerializable* const root = graph.rootAs<Serialize::ISerializable>();
    const QString content = root ? QString::fromStdString(root->GetNameInArchive()) : "nothing";
    throw Refusal{options.document, "holds neither a volume nor a transformation envelope, but " + content};
}

CurveTextSize textSize(const CurveOptions& options)
{
    CurveTextSize size;
    size.steps = options.steps;
    return size;
}

/// The text goes out before the picture, and whether or not that can be written.
bool present(const CurveOptions& options, const std::optional<PictureForm>& form, const std::string& text,
             const Picture* picture)
{
    const bool isPrinted = writeOutput(text);
    if (picture) {
        savePicture(*picture, options.picturePath, *form);
    }
    return isPrinted;
}

bool showVolume(const VolumeEnvelope& envelope, const CurveOptions& options,
                const std::optional<PictureForm>& form)
{
    const VolumeCurve found(envelope, options.span);
    const auto picture = form ? std::make_unique<VolumePicture>(found) : nullptr;
    return present(options, form, volumeText(found, textSize(options)), picture.get());
}

bool showTransformation(const TransformationEnvelope& envelope, const CurveOptions& options,
                        const std::optional<PictureForm>& form)
{
    if (options.span.hasFades()) {
        throw Refusal{options.document, "holds a transformation envelope, which takes no fades"};
    }
    const TransformationCurve found(envelope, options.span.length);
    const auto picture = form ? std::make_unique<TransformationPicture>(found) : nullptr;
    return present(options, form, transformationText(found, textSize(options)), picture.get());
}

bool showCurve(const CurveOptions& options, const std::optional<PictureForm>& form)
{
    requireFile(options.document);
    const Document::Graph graph = Document::loadFile(
        options.document, options.isOwn ? Document::OwnDocuments : Document::ForeignDocuments);
    for (const Serialize::ISerializable* root : graph.roots()) {
        if (const auto* const volume = dynamic_cast<const VolumeEnvelope*>(root)) {
            return showVolume(*volume, options, form);
        }
        if (const auto* const transformation = dynamic_cast<const TransformationEnvelope*>(root)) {
            return showTransformation(*transformation, options, form);
        }
    }
    refuseContent(options, graph);
}

} // namespace

ExitCode curve(const CurveOptions& options)
{
    try {
        const std::optional<PictureForm> form = pictureFormOfPath(options.picturePath);
        if (!form && !options.picturePath.isEmpty()) {
            throw Refusal{options.picturePath, "is no name of a picture: such a name ends in .png or .svg"};
        }
        if (options.sample != NoSample) {
            writeSample(options);
        }
        return showCurve(options, form) ? Success : Failure;
    } catch (const Refusal& refusal) {
        writeError(refusal.name, refusal.reason);
    } catch (const MediaError& error) {
        writeError(options.document, error.reason);
    } catch (const PictureError& error) {
        writeError(options.picturePath, error.reason);
    } catch (const Document::Error& error) {
        writeError(error.what());
    }
    return Failure;
}

} // namespace Host
