// SPDX-License-Identifier: Apache-2.0
#include "host/timeline/TimelineClipBox.h"

#include "host/analysis/FilmstripMaker.h"
#include "host/drawing/Axis.h"
#include "host/drawing/Picture.h"
#include "host/text/TimeText.h"
#include "host/timeline/TimelineStyle.h"

#include <EditorModel/types/Image.h>

#include <QFileInfo>
#include <QFontMetricsF>
#include <QPainter>
#include <QPainterPath>

#include <algorithm>
#include <cmath>

namespace Host {
namespace {

constexpr double stripHeight = 19.0;
constexpr double radius = 4.0;
/// Narrower boxes are plain.
constexpr double leastDetailWidth = 12.0;
constexpr double textMargin = 6.0;
/// From the end of the box to the text beside the mark of a trim.
constexpr double trimRoom = 12.0;
const QString arrow(QChar(0x25C0));
const QString factGap("   ");

class ClipBox
{
public:
    ClipBox(QPainter& painter, const TimelineLayout& layout, const TimelineOutline& outline,
            const Timeline::Clip& clip, const Filmstrip::Object* filmstrip)
        : m_painter(painter),
          m_layout(layout),
          m_clip(clip),
          m_timing(outline.timeline().clips.at(&clip)),
          m_number(outline.numberOf(&clip)),
          m_isOff(!clip.enabled || isOffByTrack(outline.timeline(), clip)),
          m_colours(m_isOff ? Style::offColours() : Style::coloursOf(kindOf(clip))),
          m_box(layout.boxOf(&clip)),
          m_filmstrip(filmstrip && filmstrip->payload ? filmstrip : nullptr)
    {}

    void draw() const
    {
        // A hair's breadth between clips that meet.
        const double inset = m_box.width() > 4.0 ? 0.75 : 0.0;
        QPainterPath outline;
        const double corner = std::min(radius, m_box.width() / 3.0);
        outline.addRoundedRect(m_box.adjusted(inset, 0.0, -inset, 0.0), corner, corner);
        m_painter.save();
        m_painter.setClipPath(outline, Qt::IntersectClip);
        fill();
        if (m_box.width() >= leastDetailWidth) {
            drawPictures();
            drawFades();
            drawTrims();
            drawName();
            drawFacts();
        }
        m_painter.restore();
        const bool isBroken = m_clip.broken;
        m_painter.setPen(QPen(isBroken ? Style::broken : m_colours.strip, isBroken ? 2.0 : 1.0,
                              isBroken ? Qt::DashLine : Qt::SolidLine));
        m_painter.setBrush(Qt::NoBrush);
        m_painter.drawPath(outline);
    }

private:
    void fill() const
    {
        m_painter.fillRect(m_box, m_colours.body);
        if (!m_clip.enabled) {
            m_painter.fillRect(clipBody(m_box), QBrush(QColor(203, 213, 225), Qt::BDiagPattern));
        }
        m_painter.fillRect(clipStrip(m_box), m_colours.strip);
    }

    /// Side by side from the left edge, cut off at the right one.
    void drawPictures() const
    {
        if (!m_filmstrip) {
            return;
        }
        const QRectF body = clipBody(m_box);
        QRectF place(body.topLeft(), QSizeF(double(m_filmstrip->width) / pngScale, body.height()));
        m_painter.setOpacity(m_isOff ? 0.4 : 1.0);
        m_painter.setRenderHint(QPainter::SmoothPixmapTransform);
        for (const Thumbnail::Object& picture : m_filmstrip->payload->pictures) {
            if (picture.image && !picture.image->isNull()) {
                m_painter.drawPixmap(place, *picture.image, QRectF(picture.image->rect()));
            }
            place.moveLeft(place.right());
        }
        m_painter.setOpacity(1.0);
    }

    /// What a fade takes away is shaded, as it is in the picture of an envelope.
    void drawFades() const
    {
        const QRectF body = clipBody(m_box);
        const double in = std::clamp(pixels(m_timing.fadeInDuration), 0.0, m_box.width());
        const double out = std::clamp(pixels(m_timing.fadeOutDuration), 0.0, m_box.width());
        drawRamp(body.topLeft(), body.bottomLeft(), body.topLeft() + QPointF(in, 0.0), in);
        drawRamp(body.topRight(), body.bottomRight(), body.topRight() - QPointF(out, 0.0), out);
    }

    void drawRamp(const QPointF& corner, const QPointF& silent, const QPointF& full, double width) const
    {
        if (width <= 0.0) {
            return;
        }
        QColor shade = Style::fade;
        shade.setAlpha(120);
        m_painter.setPen(Qt::NoPen);
        m_painter.setBrush(shade);
        m_painter.drawPolygon(QPolygonF({corner, silent, full}));
        m_painter.setPen(QPen(Style::fadeText, 1.3));
        m_painter.drawLine(silent, full);
    }

    bool isTrimmedLeft() const { return m_timing.sourcePosition > MTime(); }
    bool isTrimmedRight() const
    {
        const double shown =
            static_cast<double>(m_timing.sourcePosition.ms()) + static_cast<double>(m_timing.duration.ms());
        return shown < static_cast<double>(m_timing.sourceDuration.ms());
    }

    /// Small arrowheads in the strip that point to where the source goes on; transitions leave them free.
    void drawTrims() const
    {
        const double y = clipStrip(m_box).center().y();
        m_painter.setPen(Qt::NoPen);
        m_painter.setBrush(Qt::white);
        if (isTrimmedLeft()) {
            const double x = m_box.left() + 3.0;
            m_painter.drawPolygon(QPolygonF({{x, y}, {x + 5.0, y - 5.0}, {x + 5.0, y + 5.0}}));
        }
        if (isTrimmedRight()) {
            const double x = m_box.right() - 3.0;
            m_painter.drawPolygon(QPolygonF({{x, y}, {x - 5.0, y - 5.0}, {x - 5.0, y + 5.0}}));
        }
    }

    /// The number, then the name as far as there is room.
    void drawName() const
    {
        const QRectF area = clipStrip(m_box).adjusted(isTrimmedLeft() ? trimRoom : textMargin, 0.0,
                                                      isTrimmedRight() ? -trimRoom : -textMargin, 0.0);
        const QString number = QString::number(m_number);
        m_painter.setFont(Style::font(11));
        const double numberWidth = QFontMetricsF(m_painter.font()).horizontalAdvance(number);
        if (numberWidth > area.width() + 2.0) {
            return;
        }
        QColor faint(Qt::white);
        faint.setAlpha(200);
        m_painter.setPen(faint);
        m_painter.drawText(area, Qt::AlignLeft | Qt::AlignVCenter | Qt::TextDontClip, number);
        m_painter.setFont(Style::font(11, QFont::Bold));
        const QRectF rest = area.adjusted(numberWidth + 6.0, 0.0, 0.0, 0.0);
        // A single letter and dots tell nothing.
        if (rest.width() >= 24.0) {
            m_painter.setPen(Qt::white);
            m_painter.drawText(rest, Qt::AlignLeft | Qt::AlignVCenter, nameFor(rest.width()));
        }
    }

    /// The ending of a file's name is what can best be spared.
    QString nameFor(double width) const
    {
        const QFontMetricsF metrics(m_painter.font());
        const QString name = nameOf(m_clip);
        if (metrics.horizontalAdvance(name) <= width) {
            return name;
        }
        const QString stem = QFileInfo(name).completeBaseName();
        return metrics.elidedText(stem.isEmpty() ? name : stem, Qt::ElideRight, width);
    }

    double pixels(MTime span) const
    {
        return double(span.ms()) / (m_layout.end() - m_layout.begin()) * m_layout.rowsArea().width();
    }

    /// In one line between the transitions, and beside the fade-in where there is room for both.
    void drawFacts() const
    {
        const QRectF body = clipBody(m_box);
        const double left = m_box.left() + std::max(0.0, pixels(m_timing.transitionIn)) + textMargin;
        const double right = m_box.right() - std::max(0.0, pixels(m_timing.transitionOut)) - textMargin;
        m_painter.setFont(Style::font(10));
        m_painter.setPen(m_colours.text);
        const QStringList facts = allFacts();
        const double besideFade = m_box.left() + std::max(0.0, pixels(m_timing.fadeInDuration)) + textMargin;
        const double needed = QFontMetricsF(m_painter.font()).horizontalAdvance(facts.join(factGap));
        const double begin = besideFade + needed <= right ? std::max(left, besideFade) : left;
        drawLine(QRectF(begin, body.top() + 3.0, right - begin, 16.0), facts);
    }

    QStringList allFacts() const
    {
        return QStringList(QString::fromStdString(spanText(m_timing.duration))) + otherFacts();
    }

    QStringList otherFacts() const
    {
        QStringList facts;
        const double speed = sourceStretchOf(m_clip, m_timing).speed;
        const std::string factor = numberText(std::round(speed * 100.0) / 100.0);
        if (speed != 0.0 && factor != "1") {
            facts << QString::fromUtf8("×") + QString::fromStdString(factor);
        }
        if (m_timing.reversed) {
            facts << arrow + QStringLiteral(" reversed");
        }
        if (m_clip.broken) {
            facts << "broken";
        }
        if (!m_clip.enabled) {
            facts << "disabled";
        }
        if (m_clip.isIntroClip() || m_clip.type == Timeline::Clip::IntroOverlayClip) {
            facts << "intro";
        }
        if (!m_clip.effects.empty()) {
            facts << "fx " + QString::number(m_clip.effects.size());
        }
        return facts;
    }

    /// As many of the texts as there is room for; of the direction at least the arrow.
    void drawLine(const QRectF& area, const QStringList& texts) const
    {
        const QFontMetricsF metrics(m_painter.font());
        QString line;
        for (const QString& text : texts) {
            const QStringList forms = text.startsWith(arrow) ? QStringList({text, arrow}) : QStringList(text);
            for (const QString& form : forms) {
                const QString longer = line.isEmpty() ? form : line + factGap + form;
                if (metrics.horizontalAdvance(longer) <= area.width()) {
                    line = longer;
                    break;
                }
            }
        }
        if (m_filmstrip && !line.isEmpty()) {
            QColor ground = m_colours.body;
            ground.setAlpha(215);
            const double width = metrics.horizontalAdvance(line) + 6.0;
            m_painter.fillRect(QRectF(area.left() - 3.0, area.top(), width, area.height()), ground);
        }
        m_painter.drawText(area, Qt::AlignLeft | Qt::AlignVCenter | Qt::TextDontClip, line);
    }

    QPainter& m_painter;
    const TimelineLayout& m_layout;
    const Timeline::Clip& m_clip;
    const Timeline::ClipTiming& m_timing;
    const int m_number;
    const bool m_isOff;
    const Style::ClipColours m_colours;
    const QRectF m_box;
    /// Null if there are no pictures.
    const Filmstrip::Object* const m_filmstrip;
};

} // namespace

QRectF clipStrip(const QRectF& box)
{
    return QRectF(box.left(), box.top(), box.width(), box.width() < leastDetailWidth ? 0.0 : stripHeight);
}

QRectF clipBody(const QRectF& box)
{
    return box.adjusted(0.0, clipStrip(box).height(), 0.0, 0.0);
}

void drawClipBox(QPainter& painter, const TimelineLayout& layout, const TimelineOutline& outline,
                 const Timeline::Clip& clip, const Filmstrip::Object* filmstrip)
{
    ClipBox(painter, layout, outline, clip, filmstrip).draw();
}

} // namespace Host
