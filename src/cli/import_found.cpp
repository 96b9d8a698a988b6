#include "cli/import_found.h"

#include "data/field_names.h"

#include <QStringList>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

QString ShellWord(const QString& word)
{
    return u'\'' + QString(word).replace(u'\'', u"'\\''"_s) + u'\'';
}

QString CharacterWord(char16_t character)
{
    switch (character) {
    case u',':
        return u"comma"_s;
    case u';':
        return u"semicolon"_s;
    case u'\t':
        return u"tab"_s;
    case u' ':
        return u"space"_s;
    case 0:
        return u"none"_s;
    default:
        return ShellWord(QChar(character));
    }
}

QString ColumnWord(const ImportColumn& column)
{
    if (column.ignored)
        return u"-"_s;
    QString type;
    TypeNameOfField(column.type, type);
    const bool isPlain = !column.field.contains(u',') && !column.field.contains(u':');
    const QString name = isPlain ? column.field : u'[' + column.field + u']';
    return name + u':' + type + (column.type == FieldType::Text ? u':' + QString::number(column.size) : QString());
}

QString LineEndsText(LineEnds ends)
{
    switch (ends) {
    case LineEnds::None:
        return u"no line ends"_s;
    case LineEnds::Lf:
        return u"line ends LF"_s;
    case LineEnds::CrLf:
        return u"line ends CR LF"_s;
    case LineEnds::Cr:
        return u"line ends CR"_s;
    case LineEnds::Mixed:
        return u"mixed line ends"_s;
    }
    return {};
}

} // namespace

QString FoundText(const CsvFound& found)
{
    const CsvFormat& format = found.format;
    QStringList words = {u"--separator"_s, CharacterWord(format.separator), u"--quote"_s,
                         format.quote == 0 ? u"none"_s : ShellWord(QChar(format.quote))};
    if (format.doubledQuotes)
        words += u"--quoted-lines"_s;
    words += format.namesInFirstLine ? u"--header"_s : u"--no-header"_s;
    words += {u"--encoding"_s, format.encoding};
    if (format.dates.order != DateOrder::Locale) {
        words += {u"--date-order"_s,     QString::number(int(format.dates.order)),
                  u"--date-separator"_s, CharacterWord(format.dates.dateSeparator),
                  u"--time-separator"_s, CharacterWord(format.dates.timeSeparator)};
    }
    if (format.decimal == u',')
        words += {u"--decimal"_s, u"comma"_s};
    if (found.longTexts == CellReader::LongTexts::KeepWhole)
        words += u"--whole-texts"_s;
    QStringList columns;
    for (const ImportColumn& column : found.columns)
        columns += ColumnWord(column);
    words += {u"--columns"_s, ShellWord(columns.join(u','))};
    QStringList notes = {LineEndsText(found.lineEnds), u"%1 record(s)"_s.arg(found.records)};
    if (format.dropNuls)
        notes += u"NUL characters left out"_s;
    if (found.failingLines > 0)
        notes += u"%1 line(s) are no text in this encoding"_s.arg(found.failingLines);
    return words.join(u' ') + u" ("_s + notes.join(u", "_s) + u')';
}

} // namespace mirel::cli
