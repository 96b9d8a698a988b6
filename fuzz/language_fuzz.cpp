// A file of a language: whatever it holds, each text of the system has a pattern or is English, in any number.
#include "resources/language.h"
#include "resources/string_rows.h"

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const auto texts = mirel::LanguageTexts::Read(QByteArrayView(data, qsizetype(size)));
    if (!texts)
        return 0;
    qsizetype translated = 0;
    for (const mirel::StringRow& row : mirel::StringRows()) {
        for (const quint64 count : {0, 1, 2, 5, 11, 100})
            translated += texts->Pattern(row.id, count).size() > 0 ? 1 : 0;
    }
    if (translated > 0 && texts->Count() == 0)
        __builtin_trap();
    return 0;
}
