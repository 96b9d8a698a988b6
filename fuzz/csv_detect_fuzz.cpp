// Lets Detect look at any bytes. What it found must then hold: every line that is text becomes a record of the
// columns that it says, and nothing of a number is left out.
#include "csvimport/csv_detect.h"
#include "csvimport/import_check.h"

#include <QBuffer>

#include <cstdint>

using namespace mirel;

namespace {

// Says nothing, and never stops.
class SilentPrompt : public UserPrompt {
public:
    bool AskYesNo(const UserMessage&) override { return false; }
    void Show(const UserMessage&) override {}
    void ShowError(const QString&) override {}
    std::optional<QString> AskText(const UserMessage&, const UserMessage&, const QString&) override { return {}; }
    std::unique_ptr<Progress> StartProgress(const UserMessage&, qint64) override
    {
        return std::make_unique<EndlessProgress>();
    }

private:
    struct EndlessProgress : Progress {
        bool Advance(qint64) override { return true; }
    };
};

void Require(bool holds)
{
    if (!holds)
        __builtin_trap();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    QBuffer file;
    file.setData(reinterpret_cast<const char*>(data), int(size));
    if (!file.open(QIODevice::ReadOnly))
        return 0;
    SilentPrompt prompt;
    CsvFound found;
    if (!DetectCsv(file, {}, found, prompt))
        return 0;
    Require(!found.columns.empty() && file.seek(0));
    const ImportPlan plan{
        .format = found.format, .table = {}, .columns = found.columns, .longTexts = found.longTexts};
    std::vector<ResultField> fields;
    for (const ImportColumn& column : found.columns) {
        if (column.ignored)
            continue;
        ResultField field;
        field.name = column.field;
        field.type = column.type;
        field.size = column.type == FieldType::Text ? column.size : -1;
        fields.push_back(field);
    }
    ImportCheck check(file, plan, fields, nullptr, ImportCheck::OnFailure::GoOn);
    while (check.Step(1000)) {
    }
    Require(check.FailingLines() <= found.failingLines + 1); // the header may be no text
    ImportReport report;
    check.CountWhatWasCut(report);
    Require(report.cutNumbers == 0);
    return 0;
}
