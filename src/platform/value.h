#pragma once

#include <QByteArray>
#include <QString>

#include <optional>
#include <variant>

namespace mirel {

// The kinds of value that cross the data layer, with the domain's numbers.
enum class ValueTag : int {
    Empty = 0,
    Null = 1,
    SmallInt = 2,
    Integer = 3,
    Double = 5,
    Date = 7,
    Text = 8,
    Bool = 11,
    Binary = 0x2011,
};

// One value of a record: a small value type, copied freely.
//
// A date is an OLE day number: days since 1899-12-30, the fraction is the time of day (see ole_date.h).
// Empty means that nothing was read yet, Null is the database's NULL; both show as an empty text.
class Value {
public:
    Value() = default; // Empty
    static Value Null() { return Value(NullContent{}); }
    static Value SmallInt(qint16 number) { return Value(number); }
    static Value Integer(qint32 number) { return Value(number); }
    static Value Double(double number) { return Value(number); }
    // An Integer; beyond 32 bits, which only other programs' files hold, a Double that keeps every digit.
    static Value Whole(qint64 number)
    {
        return number == qint32(number) ? Integer(qint32(number)) : Value(Content(number));
    }
    static Value Date(double oleDays) { return Value(DateContent{oleDays}); }
    static Value Text(QString text) { return Value(std::move(text)); }
    static Value Bool(bool truth) { return Value(truth); }
    static Value Binary(QByteArray bytes) { return Value(std::move(bytes)); }

    ValueTag Tag() const;
    bool IsNull() const
    {
        return std::holds_alternative<std::monostate>(content_) || std::holds_alternative<NullContent>(content_);
    }

    // Each reads a value of its own tag; any other tag gives 0, false or an empty result. Number() reads both
    // integer tags, Double, Date (the day number) and Bool (1 or 0).
    double Number() const;
    qint32 ToInt() const; // SmallInt, Integer and Bool
    // To the last digit: what was made by SmallInt, Integer or Whole. Empty for every other number.
    std::optional<qint64> WholeNumber() const;
    bool ToBool() const;
    QString ToText() const;
    // The text without sharing it; valid until the value changes.
    QStringView TextView() const
    {
        const auto* text = std::get_if<QString>(&content_);
        return text ? QStringView(*text) : QStringView();
    }
    QByteArray ToBinary() const;

    friend bool operator==(const Value&, const Value&) = default;

private:
    struct NullContent {
        friend bool operator==(const NullContent&, const NullContent&) = default;
    };
    struct DateContent {
        double oleDays;
        friend bool operator==(const DateContent&, const DateContent&) = default;
    };
    using Content = std::variant<std::monostate, NullContent, qint16, qint32, double, DateContent, QString, bool,
                                 QByteArray, qint64>;

    explicit Value(Content content)
        : content_(std::move(content))
    {
    }

    Content content_;
};

} // namespace mirel
