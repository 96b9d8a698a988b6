#pragma once

#include "platform/cell.h"
#include "platform/hr.h"
#include "platform/ole_date.h"
#include "provider/provider.h"

#include <QByteArray>

namespace mirel::sqlite {

// Holds cells against their column and makes of them what the file stores: what fits stays the caller's bytes,
// the rest is converted as every value is.
class CellChecker {
public:
    explicit CellChecker(const ResultField& field)
        : type_(field.type)
        , size_(field.size)
    {
    }

    // `stored` is good until the next call and as long as the cell's bytes are; on failure it is left alone.
    [[nodiscard]] Hr Check(const Cell& cell, Cell& stored);

private:
    [[nodiscard]] Hr CheckText(std::string_view utf8, Cell& stored) const;
    [[nodiscard]] Hr CheckDate(std::string_view text, Cell& stored);
    [[nodiscard]] Hr CheckInteger(qint64 number, Cell& stored) const;
    [[nodiscard]] Hr Convert(const Cell& cell, Cell& stored);

    FieldType type_;
    int size_;
    StoredDate date_;
    QByteArray converted_;
};

} // namespace mirel::sqlite
