// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/Project.h>
#include <EditorModel/media/File.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/timeline/Timeline.h>

#include <QBuffer>

#include <iostream>

QByteArray written()
{
    Media::File file;
    file.setPath("beach.mp4")->setLength(20000);

    Timeline::Clip clip;
    clip.setType(Timeline::Clip::VideoClip)->setName("the beach")->setFile(&file);
    Timeline::Track track(PrimaryTrack);

    Timeline::Object timeline;
    timeline.addTrack(&track);
    timeline.addClip(&clip, Timeline::ClipTiming().setTrack(&track).setTimestamp(1500).setDuration(4000));

    Project::Content project;
    project.timeline = &timeline;

    QBuffer buffer; // any open QIODevice
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, project, Document::Json, Document::Stream);
    return buffer.data();
}

void show(QByteArray document)
{
    QBuffer buffer(&document);
    buffer.open(QIODevice::ReadOnly);
    try {
        // Owns all that is made, and is kept as long as anybody uses it.
        const Document::Graph graph = Document::load(buffer, Document::ForeignDocuments);
        std::cout << graph.size() << " objects\n";

        // A document of something else has no project; and any pointer in anybody's document may be null.
        const auto* project = graph.rootAs<Project::Content>();
        if (!project || !project->timeline) {
            return;
        }
        for (const auto& [clip, timing] : project->timeline->clips) {
            if (clip && clip->file) {
                std::cout << clip->name.toStdString() << ", of " << clip->file->path.toStdString()
                          << ", from " << timing.timestamp.ms() << " ms on\n";
            }
        }
    } catch (const Document::Error& error) {
        std::cout << error.form() << ": " << error.reason() << '\n';
    }
}

int main()
{
    const QByteArray document = written();
    show(document);
    show(document.left(20)); // the rest got lost
}
