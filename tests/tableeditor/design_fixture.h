#pragma once

#include "data/field_names.h"
#include "support/test_database.h"
#include "tableeditor/table_designer.h"

#include <algorithm>
#include <cstring>

namespace mirel {

// A database with a table of records, and what is needed to see that a change of its structure kept them.
class DesignFixture : public TestDatabase {
protected:
    std::optional<TableDesign> Read(const QString& table)
    {
        return ReadTableDesign(connection_, path_, table, prompt_);
    }
    // "Name Text 40 NO, Qty Integer ASC"
    QString Describe(const std::vector<FieldDesign>& fields)
    {
        QStringList texts;
        for (const FieldDesign& field : fields) {
            QString type;
            TypeNameOfField(field.type, type);
            const QString size = field.type == FieldType::Text ? QStringLiteral(" %1").arg(field.size) : QString();
            texts +=
                field.name + QLatin1Char(' ') + type + size + QLatin1Char(' ') + WordOfIndexOrder(field.index);
        }
        return texts.join(QStringLiteral(", "));
    }
    QString Describe(const QString& table)
    {
        const std::optional<TableDesign> design = Read(table);
        return design ? Describe(design->fields) : QStringLiteral("gone");
    }
    // Row id and values of every record, a text each.
    QStringList Records(const QString& statement)
    {
        QStringList records;
        DbRecordset rows(connection_);
        EXPECT_TRUE(Open(rows, statement)) << statement.toStdString();
        while (!rows.IsEof()) {
            qint64 rowId = 0;
            const QByteArray key = rows.IdInTable().Key();
            memcpy(&rowId, key.constData(), std::min(size_t(key.size()), sizeof rowId));
            QStringList texts = {QString::number(rowId)};
            for (int field = 0; field < rows.FieldCount(); ++field)
                texts += rows.FieldValue(field).IsNull() ? QStringLiteral("NULL") : rows.ValueText(field);
            records += texts.join(QLatin1Char('|'));
            if (!rows.MoveNext())
                break;
        }
        return records;
    }
};

} // namespace mirel
