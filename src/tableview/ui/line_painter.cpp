#include "tableview/ui/line_painter.h"

#include <QGlyphRun>

#include <algorithm>
#include <cmath>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

bool IsLineControl(QChar letter)
{
    return letter == u'\n' || letter == u'\r' || letter == u'\t' || letter == QChar::LineSeparator ||
           letter == QChar::ParagraphSeparator;
}

} // namespace

LinePainter::LinePainter(const QFont& font)
    : metrics_(font)
    , raw_(QRawFont::fromFont(font))
{
}

const LinePainter::Glyph& LinePainter::LookUp(QChar letter) const
{
    Glyph& glyph = glyphs_[letter.unicode()];
    glyph.isKnown = true;
    const QList<quint32> indexes = raw_.glyphIndexesForString(letter);
    const QList<QPointF> advances = raw_.advancesForGlyphIndexes(indexes);
    if (indexes.size() == 1 && advances.size() == 1 && indexes[0] != 0 && letter.isPrint()) {
        glyph.index = indexes[0];
        glyph.advance = float(advances[0].x());
    }
    return glyph;
}

bool LinePainter::IsPlain(QStringView text) const
{
    return std::ranges::all_of(
        text, [this](QChar letter) { return letter.unicode() < kFirstUnknown && AdvanceOf(letter) > 0; });
}

int LinePainter::WidthOf(const QString& text) const
{
    if (!IsPlain(text))
        return metrics_.horizontalAdvance(text);
    float width = 0;
    for (const QChar letter : text)
        width += AdvanceOf(letter);
    return int(std::ceil(width));
}

QString LinePainter::Cut(const QString& text, int width) const
{
    if (!IsPlain(text))
        return metrics_.elidedText(text, Qt::ElideRight, width);
    float used = float(metrics_.horizontalAdvance(u'…'));
    qsizetype fitting = 0;
    while (fitting < text.size() && used + AdvanceOf(text[fitting]) <= float(width))
        used += AdvanceOf(text[fitting++]);
    return text.left(fitting) + u'…';
}

void LinePainter::Draw(QPainter& painter, const QRect& cell, const QString& text, Qt::Alignment side)
{
    int width = WidthOf(text);
    QString drawn = text;
    if (width > cell.width()) {
        drawn = Cut(text, cell.width());
        width = WidthOf(drawn);
    }
    const int left = side & Qt::AlignRight ? std::max(cell.right() + 1 - width, cell.left()) : cell.left();
    const int baseline = cell.top() + (cell.height() - metrics_.height()) / 2 + metrics_.ascent();
    if (IsPlain(drawn))
        DrawGlyphs(painter, QPointF(left, baseline), drawn);
    else
        painter.drawText(left, baseline, drawn);
}

void LinePainter::DrawGlyphs(QPainter& painter, QPointF baseline, QStringView text)
{
    runGlyphs_.clear();
    runPositions_.clear();
    qreal x = 0;
    for (const QChar letter : text) {
        runGlyphs_.push_back(glyphs_[letter.unicode()].index);
        runPositions_.emplace_back(x, 0);
        x += AdvanceOf(letter);
    }
    QGlyphRun run;
    run.setRawFont(raw_);
    run.setRawData(runGlyphs_.data(), runPositions_.data(), int(runGlyphs_.size()));
    painter.drawGlyphRun(baseline, run);
}

QString LinePainter::SingleLine(const QString& text)
{
    if (std::ranges::none_of(text, IsLineControl))
        return text;
    QString line = text;
    line.replace(u"\r\n"_s, u" "_s);
    std::ranges::replace_if(line, IsLineControl, QChar(u' '));
    return line;
}

} // namespace mirel
