#include "app/favorites.h"

#include <utility>

namespace mirel {
namespace {

QByteArray WithoutLineEnd(QByteArray line)
{
    while (line.endsWith('\n') || line.endsWith('\r'))
        line.chop(1);
    return line;
}

bool IsLineOf(const QByteArray& line, const QByteArray& stamp)
{
    return line.startsWith(stamp) && (line.size() == stamp.size() || line[stamp.size()] == '\t');
}

QByteArray Encoded(const QString& entry)
{
    QByteArray encoded;
    for (const char byte : entry.toUtf8()) {
        const auto code = uchar(byte);
        if (code < 0x20 || code == 0x7F || byte == '%')
            encoded += '%' + QByteArray(1, byte).toHex().toUpper();
        else
            encoded += byte;
    }
    return encoded;
}

} // namespace

QStringList FavoritesOf(const QByteArray& file, const QString& stamp)
{
    QStringList entries;
    const QByteArray wanted = stamp.toUtf8();
    for (const QByteArray& line : file.split('\n')) {
        const QByteArray own = WithoutLineEnd(line);
        if (stamp.isEmpty() || !IsLineOf(own, wanted))
            continue;
        for (const QByteArray& entry : own.sliced(wanted.size()).split('\t')) {
            if (!entry.isEmpty())
                entries += QString::fromUtf8(QByteArray::fromPercentEncoding(entry));
        }
        return entries;
    }
    return entries;
}

QByteArray WithFavorites(const QByteArray& file, const QString& stamp, const QStringList& entries)
{
    const QByteArray wanted = stamp.toUtf8();
    QByteArray own;
    for (const QString& entry : entries) {
        if (!entry.isEmpty())
            own += '\t' + Encoded(entry);
    }
    QByteArray result;
    QByteArray rest = file;
    if (!rest.isEmpty() && !rest.endsWith('\n'))
        rest += '\n';
    bool placed = own.isEmpty();
    while (!rest.isEmpty()) {
        const qsizetype end = rest.indexOf('\n') + 1;
        const QByteArray line = rest.first(end);
        rest = rest.sliced(end);
        if (!IsLineOf(WithoutLineEnd(line), wanted)) {
            result += line;
        } else if (!placed) {
            result += wanted + own + '\n';
            placed = true;
        }
    }
    return placed ? result : result + wanted + own + '\n';
}

} // namespace mirel
