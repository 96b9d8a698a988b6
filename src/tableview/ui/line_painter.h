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
// letters are looked up when they are first met; a text of these alone is drawn as a run of glyphs, without laying
// it out. All other text takes Qt's way.
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

    struct Glyph {
        quint32 index = 0;
        float advance = 0; // 0: the font has no such letter
        bool isKnown = false;
    };

    bool IsPlain(QStringView text) const;
    const Glyph& LookUp(QChar letter) const;
    float AdvanceOf(QChar letter) const
    {
        const Glyph& glyph = glyphs_[letter.unicode()];
        return glyph.isKnown ? glyph.advance : LookUp(letter).advance;
    }
    void DrawGlyphs(QPainter& painter, QPointF baseline, QStringView text);
    QString Cut(const QString& text, int width) const;

    QFontMetrics metrics_;
    QRawFont raw_;
    mutable std::array<Glyph, kFirstUnknown> glyphs_{};
    std::vector<quint32> runGlyphs_;
    std::vector<QPointF> runPositions_;
};

} // namespace mirel
