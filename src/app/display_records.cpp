#include "app/display_records.h"

#include <QRegularExpression>

namespace mirel {

using namespace Qt::StringLiterals;

QString ColorRecordText(const ColorRecord& record)
{
    QStringList parts;
    for (const quint32 color : record.colors)
        parts += u"(%1)"_s.arg(color);
    return parts.join(u',');
}

std::optional<ColorRecord> ReadColorRecord(const QString& text)
{
    if (text.isEmpty())
        return {};
    static const QRegularExpression pattern(
        uR"(^\s*\(\s*(\d+)\s*\),\(\s*(\d+)\s*\),\(\s*(\d+)\s*\),\(\s*(\d+)\s*\),\(\s*(\d+)\s*\))"_s);
    const QRegularExpressionMatch match = pattern.match(text);
    if (!match.hasMatch())
        return {};
    ColorRecord record;
    for (size_t i = 0; i < record.colors.size(); ++i) {
        bool ok = false;
        record.colors[i] = match.capturedView(int(i) + 1).toUInt(&ok);
        if (!ok)
            return {};
    }
    return record;
}

QString FontRecordText(const FontDesc& font)
{
    QString face = font.faceName;
    face.remove(u'"'); // it ends the name
    return u"(%1,%2,%3,%4,%5,\"%6\")"_s.arg(QString::number(font.italic), QString::number(font.bold),
                                            QString::number(font.strikeout), QString::number(font.underline),
                                            QString::number(font.size), face);
}

std::optional<FontDesc> ReadFontRecord(const QString& text)
{
    static const QRegularExpression pattern(
        uR"re(^\s*\(\s*(-?\d+),\s*(-?\d+),\s*(-?\d+),\s*(-?\d+),\s*(-?\d+),[^"]*"([^"]*)")re"_s);
    const QRegularExpressionMatch match = pattern.match(text);
    if (!match.hasMatch())
        return {};
    constexpr qsizetype kMaxFaceLength = 31;
    FontDesc font;
    font.italic = match.capturedView(1).toInt() != 0 ? 1 : 0;
    font.bold = match.capturedView(2).toInt() != 0 ? 1 : 0;
    font.strikeout = match.capturedView(3).toInt() != 0 ? 1 : 0;
    font.underline = match.capturedView(4).toInt() != 0 ? 1 : 0;
    font.size = match.capturedView(5).toInt();
    font.faceName = match.captured(6).left(kMaxFaceLength);
    constexpr int kMaxSize = 999;
    if (font.size < 1 || font.size > kMaxSize)
        return {};
    return font;
}

} // namespace mirel
