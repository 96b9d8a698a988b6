#include "querybuilder/statement_history.h"

#include "platform/profile.h"

#include <QUrl>

namespace mirel {
namespace {

const QString kSection = QStringLiteral("Statements");

} // namespace

// A tab stands in no encoded statement.
QStringList StatementHistory::Statements() const
{
    QStringList statements;
    for (const QString& encoded : profile_.ReadText(kSection, key_, {}).split(u'\t', Qt::SkipEmptyParts)) {
        const QString statement = QUrl::fromPercentEncoding(encoded.toUtf8());
        if (statements.size() < kMost && !statement.trimmed().isEmpty())
            statements += statement;
    }
    return statements;
}

void StatementHistory::Add(const QString& statement)
{
    if (statement.trimmed().isEmpty() || statement.size() > kLongest)
        return;
    QStringList statements = Statements();
    if (!statements.isEmpty() && statements.first() == statement)
        return;
    statements.removeAll(statement);
    statements.prepend(statement);
    QStringList encoded;
    for (const QString& one : statements.first(std::min(statements.size(), kMost)))
        encoded += QString::fromLatin1(QUrl::toPercentEncoding(one));
    profile_.WriteText(kSection, key_, encoded.join(u'\t'));
}

} // namespace mirel
