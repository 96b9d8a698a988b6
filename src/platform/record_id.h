#pragma once

#include <QByteArray>
#include <QHashFunctions>

namespace mirel {

// Which record, wherever it is in a result: a key that its provider makes and nobody else reads. Equal keys of one
// table name one record, for as long as it is there; a key can be used again once its record is gone.
class RecordId {
public:
    RecordId() = default; // no record
    explicit RecordId(QByteArray key)
        : key_(std::move(key))
    {
    }

    bool IsNull() const { return key_.isEmpty(); }
    const QByteArray& Key() const { return key_; } // for the provider

    friend bool operator==(const RecordId&, const RecordId&) = default;
    friend size_t qHash(const RecordId& id, size_t seed = 0) { return ::qHash(id.key_, seed); }

private:
    QByteArray key_;
};

} // namespace mirel
