// Statements and expressions from a store in which a name changes: the text may be anything. The first line is the
// text, the second the old name, the third the new one.
#include "forms/name_mending.h"

#include <QList>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    using namespace mirel;
    const QList<QByteArray> lines = QByteArray(reinterpret_cast<const char*>(data), qsizetype(size)).split('\n');
    const QString text = QString::fromUtf8(lines.value(0));
    const QString from = QString::fromUtf8(lines.value(1));
    const QString to = QString::fromUtf8(lines.value(2));
    for (const auto what : {NameChange::What::Table, NameChange::What::Field}) {
        const NameChange change{what, QStringLiteral("T"), from, to};
        const NameChange other{what, QStringLiteral("T"), QStringLiteral("no such name"), to};
        (void)StatementWithNewName(text, change, QStringLiteral("T"));
        for (const ExprMode mode : {ExprMode::Value, ExprMode::Condition}) {
            (void)ExpressionWithNewName(text, change, mode, true);
            if (!text.contains(u'n', Qt::CaseInsensitive) &&
                ExpressionWithNewName(text, other, mode, true) != text)
                __builtin_trap();
        }
        if (!text.contains(u'n', Qt::CaseInsensitive) && StatementWithNewName(text, other) != text)
            __builtin_trap();
    }
    (void)TablesOfStatement(text);
    return 0;
}
