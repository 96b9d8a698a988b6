#pragma once

#include "support/printing.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

namespace mirel {

using namespace Qt::StringLiterals;

// How a run of the program ended, and what it said where.
struct Ended {
    int status;
    QString out;
    QString err;

    friend bool operator==(const Ended&, const Ended&) = default;
    friend void PrintTo(const Ended& ended, std::ostream* stream)
    {
        *stream << "status " << ended.status << "\n--- out\n"
                << ended.out.toStdString() << "--- err\n"
                << ended.err.toStdString();
    }
};

// The program as a script meets it, in a folder of its own.
class Program : public ::testing::Test {
protected:
    QString Path(const QString& name) const { return folder_.filePath(name); }

    QString WriteFile(const QString& name, const QByteArray& bytes) const
    {
        QFile file(Path(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(bytes);
        return file.fileName();
    }

    void Start(QProcess& process, const QStringList& words) const
    {
        StartProgram(process, QStringLiteral(MIREL_CLI), words);
    }

    void StartProgram(QProcess& process, const QString& program, const QStringList& words) const
    {
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(u"MIREL_HOME"_s, Path(u"home"_s));
        environment.insert(u"LC_ALL"_s, locale_);
        process.setProcessEnvironment(environment);
        process.setWorkingDirectory(folder_.path());
        process.start(program, words);
    }

    Ended Run(const QStringList& words, const QByteArray& input = {}) const
    {
        QProcess process;
        Start(process, words);
        process.write(input);
        process.closeWriteChannel();
        EXPECT_TRUE(process.waitForFinished());
        return {process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1,
                QString::fromUtf8(process.readAllStandardOutput()),
                QString::fromUtf8(process.readAllStandardError())};
    }

    QString Sql(const QString& statement, const QString& format = u"csv"_s) const
    {
        const Ended ended = Run({u"sql"_s, u"a.cdb"_s, statement, u"--format"_s, format});
        EXPECT_EQ(ended.status, 0) << ended.err.toStdString();
        return ended.out;
    }

    Ended Import(const QByteArray& file, const QStringList& options) const
    {
        WriteFile(u"a.csv"_s, file);
        return Run(QStringList{u"import"_s, u"a.cdb"_s, u"a.csv"_s, u"--table"_s, u"T"_s} + options);
    }

    void SetUp() override { ASSERT_TRUE(folder_.isValid()); }
    void NewDatabase() const { ASSERT_EQ(Run({u"new"_s, u"a.cdb"_s}), (Ended{0, {}, {}})); }

    QString locale_ = u"C"_s;

private:
    QTemporaryDir folder_;
};

} // namespace mirel
