// SPDX-License-Identifier: Apache-2.0
#include "host/commands/CurveCommand.h"

#include "host/commands/Refusal.h"
#include "host/curves/CurveSample.h"
#include "host/curves/CurveText.h"
#include "host/curves/TransformationPicture.h"
#include "host/curves/VolumePicture.h"
#include "host/drawing/Picture.h"
#include "host/project/DocumentFile.h"

#include <EditorModel/persistence/Document.h>

#include <memory>
#include <optional>
#include <string>

namespace Host {
namespace {

void writeSample(const CurveOptions& options)
{
    const VolumeEnvelope volume = sampleVolumeEnvelope();
    const TransformationEnvelope transformation = sampleTransformationEnvelope();
    const Serialize::ISerializable* const root = options.sample == VolumeSample
                                                     ? static_cast<const Serialize::ISerializable*>(&volume)
                                                     : &transformation;
    saveDocument({root}, options.document);
}

[[noreturn]] void refuseContent(const CurveOptions& options, const Document::Graph& graph)
{
    throw Refusal(options.document,
                  "holds neither a volume nor a transformation envelope, but " + contentOf(graph));
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
        throw Refusal(options.document, "holds a transformation envelope, which takes no fades");
    }
    const TransformationCurve found(envelope, options.span.length);
    const auto picture = form ? std::make_unique<TransformationPicture>(found) : nullptr;
    return present(options, form, transformationText(found, textSize(options)), picture.get());
}

bool showCurve(const CurveOptions& options, const std::optional<PictureForm>& form)
{
    const Document::Graph graph =
        loadDocument(options.document, options.isOwn ? Document::OwnDocuments : Document::ForeignDocuments);
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
    return unlessRefused([&] {
        std::optional<PictureForm> form;
        if (!options.picturePath.isEmpty()) {
            form = requirePictureForm(options.picturePath);
        }
        if (options.sample != NoSample) {
            writeSample(options);
        }
        return showCurve(options, form) ? Success : Failure;
    });
}

} // namespace Host
