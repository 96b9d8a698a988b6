// Reads any bytes as a delimited file, in every way of quoting, and makes cells and guesses of the texts. What
// the guess says must then hold for every text.
#include "csvimport/cell_reader.h"
#include "csvimport/csv_reader.h"
#include "csvimport/type_guess.h"

#include <QBuffer>

#include <cstdint>
#include <string>

using namespace mirel;

namespace {

// The input's first byte chooses how the file is read.
CsvFormat FormatOf(uint8_t choice)
{
    CsvFormat format;
    format.separator = (choice & 1) != 0 ? u';' : u',';
    format.quote = (choice & 2) != 0 ? u'\'' : u'"';
    format.doubledQuotes = (choice & 4) != 0;
    format.dates.order = DateOrder((choice >> 3) % 7);
    if ((choice & 64) != 0)
        format.encoding = QStringLiteral("UTF-16");
    if ((choice & 128) != 0)
        format.separator = u'§';
    return format;
}

void Require(bool holds)
{
    if (!holds)
        __builtin_trap();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    if (size == 0)
        return 0;
    const CsvFormat format = FormatOf(data[0]);
    QByteArray bytes(reinterpret_cast<const char*>(data) + 1, qsizetype(size - 1));
    QBuffer device(&bytes);
    if (!device.open(QIODevice::ReadOnly))
        return 0;

    constexpr int kColumns = 5;
    CsvReader reader(device, format);
    std::vector<TypeGuess> guesses(kColumns, TypeGuess(format.dates));
    std::vector<std::vector<std::string>> columns(kColumns);
    while (reader.Next(kColumns) == CsvReader::Result::Record) {
        Require(reader.Texts().size() <= kColumns);
        for (size_t i = 0; i < reader.Texts().size(); ++i) {
            const std::string_view text = reader.Texts()[i];
            Require(QByteArrayView(text.data(), qsizetype(text.size())).isValidUtf8());
            guesses[i].Add(text);
            columns[i].emplace_back(text);
        }
    }
    for (size_t i = 0; i < kColumns; ++i) {
        const ImportColumn column = guesses[i].Column();
        CellReader cells(column.type, column.dates.value_or(format.dates), CellReader::LongTexts::Cut);
        for (const std::string& text : columns[i]) {
            Cell cell;
            Require(cells.Read(text, cell) == Hr::Ok);
            if (column.type == FieldType::Text)
                Require(Utf16Length(text) <= column.size);
        }
        Require(cells.CutNumbers() == 0);
    }
    return 0;
}
