#pragma once

#include "platform/user_prompt.h"

#include <QByteArrayView>
#include <QIODevice>
#include <QString>

namespace mirel {

// What the bytes of a file say about its encoding.
struct TextLook {
    QString byteOrderMark; // the encoding that the mark at the beginning names; empty: no mark
    qint64 bytes = 0;      // of all below: how many there are
    qint64 nulsAtEven = 0; // by position in the file, from 0
    qint64 nulsAtOdd = 0;
    qint64 utf8Characters = 0; // of more than one byte
    qint64 notUtf8 = 0;        // bytes that belong to no character of UTF-8
    qint64 c1Bytes = 0; // of 0x80 to 0x9F among those: letters and marks in Windows' code page, nothing in Latin-1
    bool hasMarks = false; // '"' occurs

    // The likely encoding: that of the mark, UTF-16 by its NULs, UTF-8, else one of a byte for each character.
    QString Encoding() const;
    // Whether text in that encoding has NUL characters.
    bool HasNuls(const QString& encoding) const;
};

enum class LookResult { Done, Stopped, CannotRead };

// Reads a device to its end.
LookResult LookAtText(QIODevice& file, Progress& progress, TextLook& look);

} // namespace mirel
