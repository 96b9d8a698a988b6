#pragma once

#include "expr/expr_token.h"
#include "forms/form_store.h"
#include "forms/name_change.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace mirel {

// What refers to a name is text: statements of saved queries and forms, expressions of controls. These replace the
// name where it means that table or field, and leave all else as it is written. A text that does not read stays.

// `table`: what a statement without FROM, as forms have them, is about; empty: none. The functions below change
// texts for changes of tables and fields alone.
QString StatementWithNewName(const QString& statement, const NameChange& change, const QString& table = {});
// `mayBeBare`: a field's name without its table means that field.
QString ExpressionWithNewName(const QString& expression, const NameChange& change, ExprMode mode, bool mayBeBare);

// The tables that a statement reads or changes.
QStringList TablesOfStatement(const QString& statement);

// A form or a saved query that refers to a name, and how often.
struct NameUse {
    enum class Holder { Form, Query };

    Holder holder = Holder::Form;
    QString name;
    int places = 0;

    friend bool operator==(const NameUse&, const NameUse&) = default;
};

// Mends all that the store's forms and queries say, and tells where that was. The renamed form or query itself
// keeps its name.
std::vector<NameUse> MendNames(FormStore& store, const NameChange& change);

} // namespace mirel
