#include "forms/form_store.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QtEndian>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TextStyle LargeBlueStyle()
{
    TextStyle style;
    style.faceName.Set(u"Tahoma");
    style.bold = 1;
    style.pointSize = 14;
    style.color = 0x00FF0000;
    return style;
}

ControlDef AnEditBox()
{
    ControlDef control;
    control.controlId = 2;
    control.type = ControlType::EditBox;
    control.fieldBound = 1;
    control.hasSource = 1;
    control.editKind = EditKind::DatePicker;
    control.sourceScope = SourceScope::Record;
    control.left = 70;
    control.top = 17;
    control.height = 12;
    control.width = 94;
    control.windowStyle = 0x50811086;
    control.textStyle = LargeBlueStyle();
    control.name.Set(u"Born");
    control.defaultValue.Set(u"2001-07-04");
    control.option1 = 1;
    control.SetSource(u"People.Born");
    return control;
}

FormDef AForm(const QString& name)
{
    FormDef form;
    form.SetName(name);
    form.SetTableName(u"People");
    form.width = 235;
    form.height = 268;
    form.counterA = 1;
    form.defaultQueryOnStartup = 1;
    form.reserved = {7, 8, 9};
    form.textStyle = LargeBlueStyle();
    form.SetDefaultQuery(u"SELECT * FROM People");
    form.AddControl(AnEditBox());
    form.AddControl(ControlDef());
    return form;
}

QueryDef AQuery(const QString& name)
{
    QueryDef query;
    query.SetName(name);
    query.SetTableName(u"People");
    query.SetText(u"SELECT Name FROM People ORDER BY Born");
    return query;
}

FormStore AStore()
{
    FormStore store;
    store.AddForm(AForm(u"First"_s));
    store.AddForm(AForm(u"Second"_s));
    store.AddQuery(AQuery(u"By birthday"_s));
    return store;
}

constexpr qsizetype kHeaderBytes = 20;
constexpr qsizetype kFormBytes = 280;
constexpr qsizetype kControlBytes = 324;
constexpr qsizetype kQueryBytes = 152;

qint32 NumberAt(const QByteArray& bytes, qsizetype at)
{
    return qFromLittleEndian<qint32>(bytes.data() + at);
}

QString TextAt(const QByteArray& bytes, qsizetype at)
{
    QString text;
    for (; bytes[at] != 0 || bytes[at + 1] != 0; at += 2)
        text += QChar(qFromLittleEndian<quint16>(bytes.data() + at));
    return text;
}

TEST(StoreFile, HasItsFieldsInTheirPlaces)
{
    const QByteArray bytes = AStore().ToBytes();
    const qsizetype form = kHeaderBytes;
    const qsizetype query = form + kFormBytes; // the default query's text
    const qsizetype control = query + 2 * 21;
    const struct {
        const char* what;
        qsizetype at;
        qint32 number;
    } numbers[] = {
        {"form count", 12, 2},
        {"query count", 16, 1},
        {"form tag", form, -1},
        {"form width", form + 152, 235},
        {"control count", form + 160, 2},
        {"counter A", form + 168, 1},
        {"flags and the first reserved byte", form + 176, 0x07010000},
        {"default query length", form + 184, 21},
        {"form background", form + 188, -1},
        {"form bold", form + 192 + 68, 1},
        {"form point size", form + 192 + 80, 14},
        {"control type", control + 4, 201},
        {"edit kind", control + 16, 5},
        {"height before width", control + 32, 12},
        {"window style", control + 40, 0x50811086},
        {"lines", control + 44, -1},
        {"control text colour", control + 56 + 84, 0x00FF0000},
        {"options", control + 308, 1},
        {"source length", control + 320, 12},
    };
    for (const auto& row : numbers)
        EXPECT_EQ(NumberAt(bytes, row.at), row.number) << row.what;
    const struct {
        const char* what;
        qsizetype at;
        QString text;
    } texts[] = {
        {"form name", form + 4, u"First"_s},
        {"table name", form + 86, u"People"_s},
        {"face name", form + 192, u"Tahoma"_s},
        {"default query", query, u"SELECT * FROM People"_s},
        {"control name", control + 144, u"Born"_s},
        {"default value", control + 226, u"2001-07-04"_s},
        {"control source", control + kControlBytes, u"People.Born"_s},
    };
    for (const auto& row : texts)
        EXPECT_EQ(TextAt(bytes, row.at), row.text) << row.what;
    const qsizetype formBytes = kFormBytes + 2 * 21 + 2 * kControlBytes + 2 * 12;
    EXPECT_EQ(TextAt(bytes, kHeaderBytes + 2 * formBytes), u"By birthday"_s);
    EXPECT_EQ(bytes.size(), kHeaderBytes + 2 * formBytes + kQueryBytes + 2 * 38);
}

// The bytes of the page's hex dump; lines that it leaves out are zeros.
QByteArray BytesOfThePage()
{
    QFile page(QStringLiteral(MIREL_SOURCE_DIR "/docs/store-file.md"));
    EXPECT_TRUE(page.open(QIODevice::ReadOnly));
    static const QRegularExpression line(u"^([0-9a-f]{6})  ((?:[0-9a-f]{2} ?)+)"_s,
                                         QRegularExpression::MultilineOption);
    QByteArray bytes;
    auto lines = line.globalMatch(QString::fromUtf8(page.readAll()));
    while (lines.hasNext()) {
        const QRegularExpressionMatch match = lines.next();
        bytes.append(match.captured(1).toInt(nullptr, 16) - bytes.size(), '\0');
        bytes += QByteArray::fromHex(match.captured(2).toLatin1());
    }
    return bytes;
}

TEST(StoreFile, IsWhatItsPageSays)
{
    const QByteArray bytes = BytesOfThePage();
    FormStore store;
    ASSERT_TRUE(store.LoadFrom(bytes));
    ASSERT_EQ(store.Forms().size(), 1U);
    EXPECT_EQ(store.Forms()[0].name, u"Watch");
    ASSERT_EQ(store.Forms()[0].controls.size(), 1U);
    EXPECT_EQ(store.Forms()[0].controls[0].source.Text(), u"Birds.Species"_s);
    ASSERT_EQ(store.Queries().size(), 1U);
    EXPECT_EQ(store.Queries()[0].text.Text(), u"SELECT * FROM Birds ORDER BY Species"_s);
    EXPECT_EQ(store.ToBytes(), bytes);
}

TEST(StoreFile, DistinguishesAnEmptyTextFromNone)
{
    FormStore store;
    FormDef form;
    store.AddForm(form);
    EXPECT_EQ(store.ToBytes().size(), kHeaderBytes + kFormBytes);
    store.Forms()[0].AddControl(ControlDef());
    store.Forms()[0].controls[0].SetSource(u"");
    const QByteArray bytes = store.ToBytes();
    EXPECT_EQ(bytes.size(), kHeaderBytes + kFormBytes + kControlBytes + 2);
    FormStore again;
    EXPECT_TRUE(again.LoadFrom(bytes));
    EXPECT_TRUE(again.Forms()[0].controls[0].source.IsSet());
    EXPECT_FALSE(again.Forms()[0].defaultQuery.IsSet());
}

TEST(StoreFile, GivesBackEveryByteItDoesNotUnderstand)
{
    QByteArray bytes = AStore().ToBytes();
    const qsizetype form = kHeaderBytes;
    const qsizetype control = form + kFormBytes + 2 * 21;
    for (const qsizetype at : {qsizetype(1), qsizetype(3), form + 4 + 40, form + 86 + 64, form + 164, form + 177,
                               form + 181, form + 183, form + 192 + 66, control + 7, control + 144 + 81,
                               control + 226 + 60, control + 310, control + 319})
        bytes[at] = char(bytes[at] + 0x55);
    FormStore store;
    ASSERT_TRUE(store.LoadFrom(bytes));
    EXPECT_EQ(store.ToBytes(), bytes);
}

TEST(StoreFile, KeepsWhatIsWholeBeforeABreakAtEveryLength)
{
    const QByteArray whole = AStore().ToBytes();
    const qsizetype formBytes = kFormBytes + 2 * 21 + 2 * kControlBytes + 2 * 12;
    const qsizetype secondFormEnds = kHeaderBytes + 2 * formBytes;
    for (qsizetype size = 0; size <= whole.size(); ++size) {
        FormStore store = AStore();
        const bool complete = store.LoadFrom(QByteArrayView(whole).first(size));
        const size_t forms = size < kHeaderBytes ? 0 : size_t((size - kHeaderBytes) / formBytes);
        EXPECT_EQ(complete, size == whole.size()) << size;
        EXPECT_EQ(store.Forms().size(), std::min(forms, size_t(2))) << size;
        EXPECT_EQ(store.Queries().size(), size == whole.size() ? 1U : 0U) << size;
        if (size < secondFormEnds && forms == 1) {
            EXPECT_EQ(store.Forms()[0], AForm(u"First"_s)) << size;
        }
    }
}

TEST(StoreFile, TrustsNoLengthAndNoCount)
{
    const qsizetype form = kHeaderBytes;
    const qsizetype control = form + kFormBytes + 2 * 21;
    const struct {
        const char* what;
        qsizetype at;
        qint32 number;
        size_t forms;
        bool complete;
    } rows[] = {
        {"more forms than bytes", 12, 0x7FFFFFFF, 2, false},
        {"a negative form count is none", 12, -1, 0, false},
        {"more controls than bytes", form + 160, 0x7FFFFFFF, 0, false},
        {"a text longer than the file", form + 184, 0x7FFFFFFF, 0, false},
        {"a source longer than the file", control + 320, 0x40000000, 0, false},
        {"a negative query count is none", 16, -5, 2, true},
    };
    for (const auto& row : rows) {
        QByteArray bytes = AStore().ToBytes();
        qToLittleEndian(row.number, bytes.data() + row.at);
        FormStore store;
        const bool complete = store.LoadFrom(bytes);
        EXPECT_EQ(store.Forms().size(), row.forms) << row.what;
        if (row.number > 0 || row.complete) {
            EXPECT_EQ(complete, row.complete) << row.what;
        }
    }
}

TEST(FormRecords, CutNamesToTheirFields)
{
    FormDef form;
    form.SetName(QString(50, u'n'));
    form.SetTableName(QString(50, u't'));
    EXPECT_EQ(form.name.Text(), QString(40, u'n'));
    EXPECT_EQ(form.tableName.Text(), QString(31, u't'));
    form.SetName(QString(39, u'n') + u"\U0001F600"_s);
    EXPECT_EQ(form.name.Text(), QString(39, u'n')) << "half a character is no character";
    form.SetName(u"short");
    EXPECT_EQ(form.name.Text(), u"short"_s);
}

TEST(FormRecords, CopyFromReplacesEverythingAndSharesNothing)
{
    FormDef copy = AForm(u"Old"_s);
    copy.padding = {1, 1};
    const FormDef original = AForm(u"First"_s);
    copy.CopyFrom(original);
    EXPECT_EQ(copy, original);
    copy.controls[0].SetSource(u"changed");
    EXPECT_EQ(original.controls[0].source.Text(), u"People.Born"_s);
    copy.CopyFrom(FormDef());
    EXPECT_EQ(copy, FormDef());
}

class FormStoreOnDisk : public ::testing::Test {
protected:
    FormStore Open()
    {
        return FormStore(Path(), [this] { return now_; });
    }
    FormStore Reload()
    {
        FormStore store = Open();
        EXPECT_TRUE(store.Load());
        return store;
    }
    QString Path() const { return folder_.filePath(u"Mirel_20011024153012.RAF"_s); }
    QByteArray OnDisk() const
    {
        QFile file(Path());
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return file.readAll();
    }

    QTemporaryDir folder_;
    QDateTime now_{QDate(2001, 10, 24), QTime(15, 30, 12, 600)};
};

TEST_F(FormStoreOnDisk, IsMissingUntilItIsSaved)
{
    FormStore store = Open();
    EXPECT_FALSE(store.Load());
    EXPECT_FALSE(store.LastError().isEmpty());
    EXPECT_TRUE(store.Save());
    EXPECT_EQ(OnDisk().size(), kHeaderBytes);
    EXPECT_TRUE(Open().Load());
    EXPECT_FALSE(FormStore().Save()) << "a store without a path";
}

TEST_F(FormStoreOnDisk, StampsTheFirstSaveAndTheLast)
{
    FormStore store = Open();
    store.AddForm(AForm(u"First"_s));
    ASSERT_TRUE(store.Save());
    const quint32 first = 1003937413; // local wall clock, to the nearest second
    EXPECT_EQ(store.Created(), first);
    now_ = now_.addSecs(60);
    ASSERT_TRUE(store.Save());
    const FormStore again = Reload();
    EXPECT_EQ(again.Created(), first);
    EXPECT_EQ(again.Saved(), first + 60);
    EXPECT_EQ(again, store);
}

TEST_F(FormStoreOnDisk, LosesNoChangeOfAnotherProgram)
{
    ASSERT_TRUE(Open().Save());
    FormStore one = Reload();
    FormStore other = Reload();
    EXPECT_TRUE(one.Apply([](FormStore& store) {
        store.AddQuery(AQuery(u"one"_s));
        return true;
    }));
    EXPECT_TRUE(other.Apply([](FormStore& store) {
        store.AddQuery(AQuery(u"other"_s));
        return true;
    }));
    const FormStore both = Reload();
    EXPECT_TRUE(both.FindQuery(u"one"));
    EXPECT_TRUE(both.FindQuery(u"other"));
    EXPECT_EQ(both, other);
    EXPECT_EQ(QDir(folder_.path()).entryList(QDir::Files).size(), 1) << "nothing but the store is left behind";
}

TEST_F(FormStoreOnDisk, IsAsItWasWhenAChangeFails)
{
    FormStore store = Open();
    store.AddQuery(AQuery(u"kept"_s));
    ASSERT_TRUE(store.Save());
    const QByteArray before = OnDisk();
    const auto spoil = [](FormStore& each) { return each.RemoveQuery(u"kept"); };

    EXPECT_FALSE(store.Apply([&](FormStore& each) { return spoil(each) && false; })) << "refused";
    EXPECT_TRUE(store.FindQuery(u"kept"));
    EXPECT_TRUE(store.LastError().isEmpty());

    FormStore nowhere = store;
    nowhere = FormStore(folder_.filePath(u"no such folder/store.RAF"_s));
    nowhere.AddQuery(AQuery(u"kept"_s));
    EXPECT_FALSE(nowhere.Apply(spoil)) << "cannot be written";
    EXPECT_TRUE(nowhere.FindQuery(u"kept"));
    EXPECT_FALSE(nowhere.LastError().isEmpty());
    EXPECT_EQ(OnDisk(), before);
}

} // namespace
} // namespace mirel
