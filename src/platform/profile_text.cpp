#include "platform/profile_text.h"

#include <QList>
#include <QStringDecoder>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

std::optional<QString> Decode(const QByteArray& bytes)
{
    QStringDecoder utf8(QStringDecoder::Utf8, QStringDecoder::Flag::ConvertInitialBom); // a mark is text here
    QString text = utf8(bytes);
    if (utf8.hasError())
        return {};
    return text;
}

struct Escape {
    QChar letter;
    QChar meaning;
};
constexpr Escape kEscapes[] = {{u'n', u'\n'}, {u'r', u'\r'}, {u't', u'\t'}, {u'"', u'"'}, {u'\\', u'\\'}};

bool NeedsQuotes(QChar character)
{
    return character.category() == QChar::Other_Control || character.isSurrogate();
}

QString Quoted(const QString& value)
{
    QString quoted = u"\""_s;
    for (const QChar character : value) {
        const Escape* escape = std::ranges::find(kEscapes, character, &Escape::meaning);
        if (escape != std::end(kEscapes))
            quoted += u'\\' + QString(escape->letter);
        else if (NeedsQuotes(character))
            quoted += u"\\u%1"_s.arg(uint(character.unicode()), 4, 16, QChar(u'0'));
        else
            quoted += character;
    }
    return quoted + u'"';
}

std::optional<QString> Unquoted(QStringView quoted)
{
    QString value;
    for (qsizetype i = 1; i < quoted.size(); ++i) {
        if (quoted[i] == u'"')
            return i == quoted.size() - 1 ? std::optional(value) : std::nullopt;
        if (quoted[i] != u'\\') {
            value += quoted[i];
            continue;
        }
        if (++i == quoted.size())
            return {};
        if (quoted[i] == u'u') {
            bool ok = false;
            const ushort unit = quoted.mid(i + 1, 4).toUShort(&ok, 16);
            if (!ok || i + 4 >= quoted.size())
                return {};
            value += QChar(unit);
            i += 4;
            continue;
        }
        const Escape* escape = std::ranges::find(kEscapes, quoted[i], &Escape::letter);
        if (escape == std::end(kEscapes))
            return {};
        value += escape->meaning;
    }
    return {};
}

QString ValueForLine(const QString& value)
{
    const bool plain =
        value == value.trimmed() && !value.startsWith(u'"') && std::ranges::none_of(value, NeedsQuotes);
    return plain ? value : Quoted(value);
}

bool Names(const QByteArray& bytes, const QString& name)
{
    const std::optional<QString> text = Decode(bytes.trimmed());
    return text && text->compare(name, Qt::CaseInsensitive) == 0;
}

// The name between the brackets of a section's line; empty for every other line.
QByteArray SectionOf(const QByteArray& line)
{
    const QByteArray trimmed = line.trimmed();
    return trimmed.startsWith('[') && trimmed.endsWith(']') ? trimmed.sliced(1).chopped(1) : QByteArray();
}

bool IsComment(const QByteArray& line)
{
    const QByteArray trimmed = line.trimmed();
    return trimmed.startsWith(';') || trimmed.startsWith('#');
}

bool CanBeName(const QString& name)
{
    return !name.isEmpty() && name == name.trimmed() && std::ranges::none_of(name, NeedsQuotes) &&
           !name.contains(u'=') && !name.contains(u'[') && !name.contains(u']') && !name.startsWith(u';') &&
           !name.startsWith(u'#');
}

} // namespace

ProfileText::ProfileText(const QByteArray& bytes)
    : lineEnd_(bytes.contains("\r\n") ? "\r\n" : "\n")
{
    const QByteArrayView mark = "\xEF\xBB\xBF";
    QByteArray text = bytes.startsWith(mark) ? bytes.sliced(mark.size()) : bytes;
    if (text.isEmpty())
        return;
    for (QByteArray& line : text.split('\n')) {
        if (lineEnd_.size() == 2 && line.endsWith('\r'))
            line.chop(1);
        lines_.push_back(std::move(line));
    }
    if (lines_.back().isEmpty()) // behind the last line's end
        lines_.pop_back();
}

ProfileText::Place ProfileText::Locate(const QString& section, const QString& key) const
{
    Place place;
    bool inside = false;
    for (qsizetype i = 0; i < qsizetype(lines_.size()); ++i) {
        const QByteArray& line = lines_[size_t(i)];
        const QByteArray name = SectionOf(line);
        if (!name.isEmpty()) {
            inside = Names(name, section);
            if (inside && place.insertion < 0)
                place.insertion = i + 1;
            continue;
        }
        const qsizetype equals = line.indexOf('=');
        if (!inside || equals < 0 || IsComment(line))
            continue;
        place.insertion = i + 1;
        if (Names(line.first(equals), key)) {
            place.line = i;
            return place;
        }
    }
    return place;
}

std::optional<QString> ProfileText::Find(const QString& section, const QString& key) const
{
    const qsizetype at = Locate(section, key).line;
    if (at < 0)
        return {};
    const QByteArray& line = lines_[size_t(at)];
    const std::optional<QString> text = Decode(line.sliced(line.indexOf('=') + 1));
    if (!text)
        return {};
    const QString value = text->trimmed();
    return value.startsWith(u'"') ? Unquoted(value) : value;
}

bool ProfileText::Set(const QString& section, const QString& key, const QString& value)
{
    if (!CanBeName(section) || !CanBeName(key))
        return false;
    const QByteArray line = key.toUtf8() + '=' + ValueForLine(value).toUtf8();
    Place place = Locate(section, key);
    if (place.line >= 0) {
        lines_[size_t(place.line)] = line;
        return true;
    }
    if (place.insertion < 0) {
        if (!lines_.empty())
            lines_.emplace_back();
        lines_.push_back('[' + section.toUtf8() + ']');
        place.insertion = qsizetype(lines_.size());
    }
    lines_.insert(lines_.begin() + place.insertion, line);
    return true;
}

QByteArray ProfileText::Bytes() const
{
    QByteArray bytes;
    for (const QByteArray& line : lines_)
        bytes += line + lineEnd_;
    return bytes;
}

} // namespace mirel
