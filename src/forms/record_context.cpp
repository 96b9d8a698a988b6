#include "forms/record_context.h"

#include "expr/expr_token.h"

namespace mirel {
namespace {

QString WithoutBlanks(QStringView text)
{
    return text.toString().remove(u' ');
}

// The parts of a field name as an expression writes it.
struct WrittenName {
    QString whole; // without brackets
    QString table; // empty where there is none
    QString field;

    explicit WrittenName(QStringView written)
        : whole(BareName(written))
    {
        const qsizetype dot = LastDotOutsideBrackets(written);
        table = BareName(written.first(std::max<qsizetype>(dot, 0)));
        field = BareName(written.sliced(dot + 1));
    }

private:
    static qsizetype LastDotOutsideBrackets(QStringView name)
    {
        qsizetype dot = -1;
        bool inside = false;
        for (qsizetype i = 0; i < name.size(); ++i) {
            if (inside && name[i] == u']' && i + 1 < name.size() && name[i + 1] == u']')
                ++i;
            else if (name[i] == u']' || (name[i] == u'[' && !inside))
                inside = name[i] == u'[';
            else if (name[i] == u'.' && !inside)
                dot = i;
        }
        return dot;
    }
};

// The first column that `isMeant` takes, with names compared exactly, else without regard to case and blanks.
template <typename IsMeant>
int FindField(std::span<const ResultField> fields, IsMeant isMeant)
{
    const auto exact = [](const QString& name, QStringView written) { return name == written; };
    const auto loose = [](const QString& name, QStringView written) {
        return WithoutBlanks(name).compare(WithoutBlanks(written), Qt::CaseInsensitive) == 0;
    };
    for (size_t i = 0; i < fields.size(); ++i) {
        if (isMeant(fields[i], exact))
            return int(i);
    }
    for (size_t i = 0; i < fields.size(); ++i) {
        if (isMeant(fields[i], loose))
            return int(i);
    }
    return -1;
}

int FindByName(std::span<const ResultField> fields, QStringView name)
{
    return FindField(fields, [name](const ResultField& field, auto same) { return same(field.name, name); });
}

int FindByTable(std::span<const ResultField> fields, const WrittenName& name)
{
    return FindField(fields, [&name](const ResultField& field, auto same) {
        return same(field.table, name.table) && same(field.column, name.field);
    });
}

} // namespace

RecordContext::RecordContext(DbRecordset& records, YesNoWords words, ControlTexts controlTexts)
    : records_(records)
    , words_(std::move(words))
    , controlTexts_(std::move(controlTexts))
{
    ResultChanged();
}

void RecordContext::ResultChanged()
{
    ColumnsChanged();
    values_.assign(size_t(records_.FieldCount()), {}); // room for all: what is lent must not move
    position_ = -1;
    ++record_;
}

void RecordContext::BeginEvaluation()
{
    const qint64 position = records_.Position();
    const quint64 generation = records_.Generation();
    if (position == position_ && generation == generation_)
        return;
    position_ = position;
    generation_ = generation;
    ++record_;
}

qint64 RecordContext::Position()
{
    return records_.Position();
}

qint64 RecordContext::RecordCount()
{
    if (countedAt_ != record_) {
        count_ = records_.RecordCount();
        countedAt_ = record_;
    }
    return count_;
}

int RecordContext::FindColumn(QStringView name)
{
    const std::span<const ResultField> fields = records_.Fields();
    const WrittenName written(name);
    int column = FindByName(fields, name);
    if (column < 0)
        column = FindByName(fields, written.whole);
    if (column < 0 && !written.table.isEmpty())
        column = FindByTable(fields, written);
    return column < 0 ? FindByName(fields, written.field) : column;
}

FieldType RecordContext::TypeOfColumn(int column)
{
    return records_.TypeOfField(column);
}

const Value& RecordContext::FieldValue(int column)
{
    if (size_t(column) >= values_.size())
        values_.resize(size_t(column) + 1);
    FetchedValue& fetched = values_[size_t(column)];
    if (fetched.record != record_) {
        fetched.value = records_.FieldValue(column);
        fetched.record = record_;
    }
    return fetched.value;
}

QStringView RecordContext::YesNoWord(bool truth)
{
    return words_.Of(truth);
}

QString RecordContext::ControlText(QStringView name)
{
    return controlTexts_ ? controlTexts_(name) : QString();
}

} // namespace mirel
