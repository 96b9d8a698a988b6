// What the parts of an import take: cutting, guessing types, making cells.
#include "csvimport/cell_reader.h"
#include "csvimport/csv_reader.h"
#include "csvimport/type_guess.h"

#include <benchmark/benchmark.h>

#include <QBuffer>

using namespace mirel;

namespace {

const QByteArray& SampleFile()
{
    static const QByteArray file =
        QByteArray("1234,Turkey vulture,\"LaGuardia, NY\",99999,1234.56,2001-07-04,"
                   "2001-07-04 09:05:00,1,00501,\"engine runway flock approach climb\"\n")
            .repeated(20'000);
    return file;
}

constexpr int kColumns = 10;

template <typename Use>
void ReadSample(benchmark::State& state, Use use)
{
    QByteArray bytes = SampleFile();
    for (auto _ : state) {
        QBuffer device(&bytes);
        if (!device.open(QIODevice::ReadOnly))
            state.SkipWithError("cannot open");
        CsvReader reader(device, {});
        while (reader.Next(kColumns) == CsvReader::Result::Record)
            use(reader.Texts());
    }
    state.SetBytesProcessed(int64_t(state.iterations()) * bytes.size());
}

void CutRecords(benchmark::State& state)
{
    ReadSample(state, [](std::span<const std::string_view> texts) { benchmark::DoNotOptimize(texts.size()); });
}
BENCHMARK(CutRecords);

void GuessTypes(benchmark::State& state)
{
    std::vector<TypeGuess> guesses(kColumns, TypeGuess(DateFormat{}));
    ReadSample(state, [&guesses](std::span<const std::string_view> texts) {
        for (size_t i = 0; i < texts.size(); ++i)
            guesses[i].Add(texts[i]);
    });
}
BENCHMARK(GuessTypes);

void MakeCells(benchmark::State& state)
{
    std::vector<CellReader> readers;
    for (const FieldType type :
         {FieldType::Integer, FieldType::Text, FieldType::Text, FieldType::Integer, FieldType::Double,
          FieldType::Date, FieldType::Date, FieldType::Integer, FieldType::Text, FieldType::Text})
        readers.emplace_back(type, DateFormat{}, CellReader::LongTexts::Cut);
    ReadSample(state, [&readers](std::span<const std::string_view> texts) {
        for (size_t i = 0; i < texts.size(); ++i) {
            Cell cell;
            benchmark::DoNotOptimize(readers[i].Read(texts[i], cell));
        }
    });
}
BENCHMARK(MakeCells);

void ReadDate(benchmark::State& state, DateOrder order, std::string_view text)
{
    CellReader reader(FieldType::Date, {order, u'-', u':'}, CellReader::LongTexts::Cut);
    for (auto _ : state) {
        Cell cell;
        benchmark::DoNotOptimize(reader.Read(text, cell));
    }
}
BENCHMARK_CAPTURE(ReadDate, Iso, DateOrder::Locale, "2001-07-04 09:05:00");
BENCHMARK_CAPTURE(ReadDate, YearMonthDay, DateOrder::YearMonthDay, "2001-07-04 09:05:00");
BENCHMARK_CAPTURE(ReadDate, LocaleUs, DateOrder::Locale, "7/4/2001 9:05:00 AM");

} // namespace
