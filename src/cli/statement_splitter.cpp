#include "cli/statement_splitter.h"

namespace mirel::cli {
namespace {

QChar ClosingOf(QChar opening)
{
    switch (opening.unicode()) {
    case u'\'':
    case u'"':
        return opening;
    case u'[':
        return u']';
    default:
        return {};
    }
}

// What is open behind `text` when `closing` was before it.
QChar OpenBehind(QStringView text, QChar closing)
{
    for (const QChar character : text) {
        if (closing.isNull())
            closing = ClosingOf(character);
        else if (character == closing)
            closing = {};
    }
    return closing;
}

} // namespace

std::optional<QString> StatementSplitter::AddLine(const QString& line)
{
    closing_ = OpenBehind(line, closing_);
    if (!pending_.isEmpty())
        pending_ += u'\n';
    pending_ += line;
    if (!closing_.isNull() || !line.trimmed().endsWith(u';'))
        return {};
    const QString statement = WithoutSemicolon(pending_);
    pending_.clear();
    return statement;
}

QString WithoutSemicolon(const QString& statement)
{
    const QString trimmed = statement.trimmed();
    return trimmed.endsWith(u';') && OpenBehind(trimmed, {}).isNull() ? trimmed.chopped(1).trimmed() : trimmed;
}

} // namespace mirel::cli
