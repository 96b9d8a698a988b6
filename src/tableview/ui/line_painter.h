#pragma once

#include <QFont>
#include <QFontMetrics>
#include <QPainter>
#include <QRawFont>
#include <QString>

#include <array>
#include <vector>

namespace mirel {

// Measures and draws single lines of text in one font, many times a page. Advances and glyphs of the Latin
// letters are looked up once; a text of these alone is drawn as a run of glyphs, without laying it out. All
// other text takes Qt's way.
class LinePainter {
public:
    explicit LinePainter(const QFont& font);

    int LineHeight() const { return metrics_.height(); }
    int WidthOf(const QString& text) const;
    // Draws `text` on the base line of a cell, cut with "…" where it does not fit.
    void Draw(QPainter& painter, const QRect& cell, const QString& text, Qt::Alignment side);

    // Line ends and tabs as blanks: a cell has one line.
    static QString SingleLine(const QString& text);

private:
    static constexpr char16_t kFirstUnknown = 0x0250; // behind the Latin letters

    bool IsPlain(QStringView text) const;
    float AdvanceOf(QChar letter) const { return advances_[letter.unicode()]; }
    void DrawGlyphs(QPainter& painter, QPointF baseline, QStringView text);
    QString Cut(const QString& text, int width) const;

    QFontMetrics metrics_;
    QRawFont raw_;
    std::array<float, kFirstUnknown> advances_{}; // 0: the font has no such letter
    std::array<quint32, kFirstUnknown> glyphs_{};
    std::vector<quint32> runGlyphs_;
    std::vector<QPointF> runPositions_;
};

} // namespace mirel
