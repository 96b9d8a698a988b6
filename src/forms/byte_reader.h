#pragma once

#include <QByteArray>
#include <QByteArrayView>
#include <QtEndian>

namespace mirel {

// Reads little-endian fields off the front of foreign bytes. The first read that does not fit makes the reader
// fail for good; later reads give 0. So a record is read straight through, and Ok() is asked once at its end.
// Does not own the bytes, never leaves them.
class ByteReader {
public:
    explicit ByteReader(QByteArrayView bytes)
        : rest_(bytes)
    {
    }

    template <typename Number>
    Number Next()
    {
        const QByteArrayView bytes = Take(sizeof(Number));
        return bytes.isEmpty() ? Number{} : qFromLittleEndian<Number>(bytes.data());
    }
    // `count` numbers into `out`, which has room for them; none of them when they do not fit.
    template <typename Number>
    void Next(Number* out, qsizetype count)
    {
        const QByteArrayView bytes = Take(count * qsizetype(sizeof(Number)));
        if (!bytes.isEmpty())
            qFromLittleEndian<Number>(bytes.data(), count, out);
    }
    // Whether that many numbers are left: asked before room is made for them.
    template <typename Number>
    bool Has(qsizetype count) const
    {
        return ok_ && count <= rest_.size() / qsizetype(sizeof(Number));
    }
    void Fail() { ok_ = false; }
    bool Ok() const { return ok_; }

private:
    // Empty, and failed, when fewer are left.
    QByteArrayView Take(qsizetype sizeBytes)
    {
        ok_ = ok_ && sizeBytes <= rest_.size();
        if (!ok_)
            return {};
        const QByteArrayView taken = rest_.first(sizeBytes);
        rest_ = rest_.sliced(sizeBytes);
        return taken;
    }

    QByteArrayView rest_;
    bool ok_ = true;
};

// Its counterpart: appends little-endian fields.
class ByteWriter {
public:
    template <typename Number>
    void Put(Number number)
    {
        Put(&number, 1);
    }
    template <typename Number>
    void Put(const Number* numbers, qsizetype count)
    {
        const qsizetype at = bytes_.size();
        bytes_.resize(at + count * qsizetype(sizeof(Number)));
        qToLittleEndian<Number>(numbers, count, bytes_.data() + at);
    }
    const QByteArray& Bytes() const { return bytes_; }

private:
    QByteArray bytes_;
};

} // namespace mirel
