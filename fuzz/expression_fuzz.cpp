// Parses any text in both modes and evaluates it twice against a record made of the same bytes: evaluating again
// must give the same, and explanations must name a place in the text.
#include "expr/evaluator.h"
#include "expr/explain.h"
#include "expr/expr_parser.h"

#include <QStringList>

#include <cstdint>
#include <cstring>

namespace mirel {
namespace {

// Takes pieces off the front of the input; zeros and empty texts once it is used up.
class Input {
public:
    Input(const uint8_t* data, size_t size)
        : rest_(reinterpret_cast<const char*>(data), qsizetype(size))
    {
    }

    quint8 Byte()
    {
        const QByteArrayView byte = Take(1);
        return byte.isEmpty() ? quint8(0) : quint8(byte.front());
    }
    double Number()
    {
        double number = 0;
        const QByteArrayView bytes = Take(sizeof number);
        std::memcpy(&number, bytes.data(), size_t(bytes.size()));
        return number;
    }
    // Half of the texts are UTF-8, which mutations keep readable; the others are any units at all.
    QString Text(qsizetype sizeBytes)
    {
        const bool utf8 = Byte() % 2 == 0;
        const QByteArrayView bytes = Take(sizeBytes);
        if (utf8)
            return QString::fromUtf8(bytes);
        QString units(bytes.size() / 2, Qt::Uninitialized);
        std::memcpy(units.data(), bytes.data(), size_t(units.size()) * sizeof(char16_t));
        return units;
    }
    qsizetype Left() const { return rest_.size(); }

private:
    QByteArrayView Take(qsizetype size)
    {
        const QByteArrayView taken = rest_.first(std::min(size, rest_.size()));
        rest_ = rest_.sliced(taken.size());
        return taken;
    }

    QByteArrayView rest_;
};

class FuzzRecord : public EvalContext {
public:
    explicit FuzzRecord(Input& input)
    {
        for (int i = 0; i < kColumns; ++i) {
            types_[i] = kTypes[input.Byte() % std::size(kTypes)];
            values_[i] = AnyValue(input);
        }
        position_ = input.Byte() % 4 - 1;
        control_ = input.Text(input.Byte() % 16);
        word_ = input.Text(input.Byte() % 8);
    }

    qint64 Position() override { return position_; }
    qint64 RecordCount() override { return position_ + 1; }
    int FindColumn(QStringView name) override
    {
        static const QStringList kNames = {QStringLiteral("a"), QStringLiteral("[b]"), QStringLiteral("[c d]"),
                                           QStringLiteral("e")};
        return int(kNames.indexOf(name));
    }
    FieldType TypeOfColumn(int column) override { return types_[column]; }
    const Value& FieldValue(int column) override { return values_[column]; }
    QStringView YesNoWord(bool truth) override { return truth ? QStringView(word_) : QStringView(); }
    QString ControlText(QStringView) override { return control_; }
    QDateTime Now() override { return QDateTime(QDate(2001, 7, 4), QTime(9, 5, 7)); }

private:
    static constexpr int kColumns = 4;
    static constexpr FieldType kTypes[] = {FieldType::None,   FieldType::SmallInt,  FieldType::Integer,
                                           FieldType::Double, FieldType::Date,      FieldType::YesNo,
                                           FieldType::Text,   FieldType::LongBinary};

    static Value AnyValue(Input& input)
    {
        switch (input.Byte() % 8) {
        case 0:
            return Value::Null();
        case 1:
            return Value::SmallInt(qint16(input.Byte()));
        case 2:
            return Value::Integer(qint32(input.Number() > 0 ? 0x7FFFFFFF : -5));
        case 3:
            return Value::Double(input.Number());
        case 4:
            return Value::Date(input.Number());
        case 5:
            return Value::Bool(input.Byte() % 2 != 0);
        case 6:
            return Value::Binary(QByteArray("\0\xff", 2));
        default:
            return Value::Text(input.Text(input.Byte() % 32));
        }
    }

    FieldType types_[kColumns];
    Value values_[kColumns];
    qint64 position_;
    QString control_;
    QString word_;
};

struct Outcome {
    bool holds;
    bool null;
    QString shown;

    friend bool operator==(const Outcome&, const Outcome&) = default;
};

Outcome Run(ExprNode& root, EvalContext& context)
{
    const bool holds = EvaluateExpression(context, root);
    return {holds, root.null, ShownText(root)};
}

} // namespace
} // namespace mirel

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    using namespace mirel;
    Input input(data, size);
    FuzzRecord record(input);
    const QString text = input.Text(input.Left());
    for (const ExprMode mode : {ExprMode::Value, ExprMode::Condition}) {
        const ExprTree tree = ParseExpression(text, mode);
        QString dump;
        DumpExpression(tree.get(), dump);
        if (tree && Run(*tree, record) != Run(*tree, record))
            __builtin_trap();
        for (const ExprSlip& slip : ExplainExpression(text, mode, record)) {
            if (slip.position < 1 || slip.position > text.size() + 1)
                __builtin_trap();
        }
    }
    return 0;
}
