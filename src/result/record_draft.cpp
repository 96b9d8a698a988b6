#include "result/record_draft.h"

#include <QCryptographicHash>

#include <bit>

namespace mirel {
namespace {

// With its length in front, so that no two lists of texts read the same.
void Add(QCryptographicHash& hash, QByteArrayView bytes)
{
    hash.addData(QByteArray::number(bytes.size()) + ':');
    hash.addData(bytes.toByteArray());
}

QByteArray BytesOf(const Value& value)
{
    if (value.Tag() == ValueTag::Text)
        return value.ToText().toUtf8();
    if (value.Tag() == ValueTag::Binary)
        return value.ToBinary();
    if (const std::optional<qint64> whole = value.WholeNumber())
        return QByteArray::number(*whole);
    return value.IsNull() ? QByteArray() : QByteArray::number(std::bit_cast<quint64>(value.Number()), 16);
}

} // namespace

QByteArray FingerprintOf(std::span<const ResultField> fields, std::span<const Value> values)
{
    QCryptographicHash hash(QCryptographicHash::Sha256);
    for (const ResultField& field : fields)
        Add(hash, field.name.toUtf8());
    for (const Value& value : values) {
        Add(hash, QByteArray::number(int(value.Tag())));
        Add(hash, BytesOf(value));
    }
    return hash.result().toHex();
}

} // namespace mirel
