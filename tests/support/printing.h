#pragma once

#include "platform/hr.h"
#include "platform/value.h"

#include <QString>
#include <QStringList>

#include <ostream>

// How failing tests show the project's and Qt's types.

QT_BEGIN_NAMESPACE
inline void PrintTo(const QString& text, std::ostream* out)
{
    *out << '"' << text.toStdString() << '"';
}
inline void PrintTo(const QByteArray& bytes, std::ostream* out)
{
    *out << '"' << bytes.toStdString() << '"';
}
QT_END_NAMESPACE

namespace mirel {
void PrintTo(const Value& value, std::ostream* out);
void PrintTo(Hr hr, std::ostream* out);
} // namespace mirel
