#pragma once

#include "data/catalog.h"
#include "data/db_recordset.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"

#include <gtest/gtest.h>

#include <QTemporaryDir>

namespace mirel {

// A real database in a folder of its own, gone with the test.
class TestDatabase : public ::testing::Test {
protected:
    TestDatabase()
    {
        const QString statement = QStringLiteral("CREATE DATABASE ") + QuoteText(path_);
        EXPECT_TRUE(catalog_.ExecuteStatement({}, statement)) << prompt_.shown.join(u'\n').toStdString();
    }

    void Run(const QString& statement)
    {
        EXPECT_TRUE(catalog_.ExecuteStatement(path_, statement)) << statement.toStdString() << '\n'
                                                                 << prompt_.shown.join(u'\n').toStdString();
    }
    // A static result that can be changed, unless `lock` says otherwise.
    bool Open(DbRecordset& recordset, const QString& source, LockType lock = LockType::Optimistic)
    {
        return recordset.Open(source, path_, CursorType::Static, lock);
    }

    QTemporaryDir folder_;
    QString path_ = folder_.filePath(QStringLiteral("test.cdb"));
    DbConnection connection_;
    ScriptedPrompt prompt_;
    Catalog catalog_{connection_, prompt_};
};

} // namespace mirel
