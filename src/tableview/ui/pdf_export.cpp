#include "tableview/ui/pdf_export.h"

#include "platform/number_text.h"
#include "resources/string_table.h"
#include "tableview/date_texts.h"

#include <QFontMetricsF>
#include <QPageLayout>
#include <QPageSize>
#include <QPainter>
#include <QPdfWriter>
#include <QTextOption>

#include <algorithm>
#include <vector>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kDotsPerInch = 300;
constexpr double kPointSize = 9;
constexpr double kLeastPointSize = 5;
constexpr double kMarginMm = 12;
constexpr qint64 kMeasured = 200;     // records that decide on the columns' widths
constexpr double kWidestColumn = 32;  // in letters; longer texts wrap
constexpr double kPaddingShare = 0.4; // of a letter's height, at both sides of a text

// A document under way: knows the columns, and where on the page the next record goes.
class PdfTable {
public:
    PdfTable(QIODevice& device, const CsvExportOptions& options, std::span<const ResultField> fields)
        : writer_(&device)
        , options_(options)
        , fields_(fields)
        , dates_(options.dates)
    {
        writer_.setResolution(kDotsPerInch);
        writer_.setTitle(options.title);
        writer_.setPageSize(QPageSize(QPageSize::A4));
        writer_.setPageMargins(QMarginsF(kMarginMm, kMarginMm, kMarginMm, kMarginMm), QPageLayout::Millimeter);
        font_.setPointSizeF(kPointSize);
    }

    bool Begin(DbRecordset& source)
    {
        std::vector<double> wanted(fields_.size());
        const QFontMetricsF metrics(font_, &writer_);
        for (size_t i = 0; i < fields_.size(); ++i)
            wanted[i] = metrics.horizontalAdvance(fields_[i].name) * kBoldIsWider;
        const double widest = kWidestColumn * metrics.averageCharWidth();
        const bool read = source.Read({.count = kMeasured}, [&](std::span<const Cell> cells) {
            for (size_t i = 0; i < cells.size(); ++i)
                wanted[i] = std::max(wanted[i], std::min(widest, metrics.horizontalAdvance(Text(cells[i], i))));
            return true;
        });
        Fit(wanted, metrics);
        if (!read || !painter_.begin(&writer_))
            return false;
        BeginPage();
        return true;
    }

    bool Add(std::span<const Cell> cells)
    {
        const double half = writer_.height() / 2.0;
        double height = lineHeight_;
        texts_.clear();
        for (size_t i = 0; i < cells.size(); ++i) {
            texts_.push_back(Text(cells[i], i));
            height = std::max(height, std::min(half, HeightOf(texts_.back(), widths_[i])));
        }
        if (y_ + height + padding_ > writer_.height() - 2 * lineHeight_) {
            EndPage();
            if (!writer_.newPage())
                return false;
            BeginPage();
        }
        DrawRow(texts_, height);
        return true;
    }

    bool Finish()
    {
        EndPage();
        return painter_.end();
    }

private:
    static constexpr double kBoldIsWider = 1.15;

    QString Text(const Cell& cell, size_t field)
    {
        switch (cell.kind) {
        case Cell::Kind::Null:
        case Cell::Kind::Binary:
            break;
        case Cell::Kind::Integer:
            if (fields_[field].type == FieldType::YesNo)
                return options_.words.Of(cell.integer != 0);
            return QString::number(cell.integer);
        case Cell::Kind::Real: {
            const NumberBuffer number(cell.real);
            return QString::fromLatin1(number.Text().data(), qsizetype(number.Text().size()));
        }
        case Cell::Kind::Text: {
            const std::string_view date =
                fields_[field].type == FieldType::Date ? dates_.Of(cell.bytes) : std::string_view();
            const std::string_view text = date.empty() ? cell.bytes : date;
            return QString::fromUtf8(text.data(), qsizetype(text.size()));
        }
        }
        return {};
    }

    // Turns the page, then makes the letters smaller, until the columns fit; what is too wide even then shares the
    // room.
    void Fit(const std::vector<double>& wanted, const QFontMetricsF& metrics)
    {
        const double padding = 2 * kPaddingShare * metrics.height();
        double total = 0;
        for (const double width : wanted)
            total += width + padding;
        if (total > writer_.width())
            writer_.setPageOrientation(QPageLayout::Landscape);
        const double scale = std::clamp(writer_.width() / std::max(total, 1.0), kLeastPointSize / kPointSize, 1.0);
        font_.setPointSizeF(kPointSize * scale);
        const QFontMetricsF fitted(font_, &writer_);
        lineHeight_ = fitted.lineSpacing();
        padding_ = kPaddingShare * fitted.height();
        const double squeeze = std::min(1.0, writer_.width() / std::max(total * scale, 1.0));
        for (const double width : wanted)
            widths_.push_back(std::max(lineHeight_ / 2, (width + padding) * scale * squeeze - 2 * padding_));
    }

    double HeightOf(const QString& text, double width)
    {
        if (!text.contains(u'\n') && QFontMetricsF(painter_.font(), &writer_).horizontalAdvance(text) <= width)
            return lineHeight_;
        return painter_.boundingRect(QRectF(0, 0, width, 1e6), text, Wrapped(Qt::AlignLeft)).height();
    }
    // Between words where that is possible.
    static QTextOption Wrapped(Qt::Alignment alignment)
    {
        QTextOption option(alignment | Qt::AlignTop);
        option.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
        return option;
    }

    void BeginPage()
    {
        ++page_;
        y_ = 0;
        QFont bold = font_;
        bold.setBold(true);
        painter_.setFont(bold);
        QStringList names;
        double height = lineHeight_;
        for (size_t i = 0; i < fields_.size(); ++i) {
            names += fields_[i].name;
            height = std::max(height, HeightOf(names.back(), widths_[i]));
        }
        DrawRow(names, std::min(height, writer_.height() / 4.0));
        painter_.setFont(font_);
    }

    void EndPage()
    {
        painter_.setFont(font_);
        painter_.drawText(QRectF(0, writer_.height() - lineHeight_, writer_.width(), lineHeight_),
                          Qt::AlignRight | Qt::AlignBottom,
                          StringText(Str::ExportPdfPageOnly, {QString::number(page_)}));
        painter_.drawText(QRectF(0, writer_.height() - lineHeight_, writer_.width() * 0.8, lineHeight_),
                          Qt::AlignLeft | Qt::AlignBottom, options_.title);
    }

    void DrawRow(const QStringList& texts, double height)
    {
        double x = 0;
        for (size_t i = 0; i < widths_.size(); ++i) {
            const QRectF place(x + padding_, y_ + padding_ / 2, widths_[i], height);
            const bool right = IsNumber(fields_[i].type);
            painter_.save();
            painter_.setClipRect(place);
            painter_.drawText(place, texts.value(qsizetype(i)), Wrapped(right ? Qt::AlignRight : Qt::AlignLeft));
            painter_.restore();
            x += widths_[i] + 2 * padding_;
        }
        y_ += height + padding_;
        painter_.setPen(QPen(Qt::lightGray, 1));
        painter_.drawLine(QPointF(0, y_), QPointF(x, y_));
        painter_.setPen(Qt::black);
    }

    QPdfWriter writer_;
    QPainter painter_;
    const CsvExportOptions& options_;
    std::span<const ResultField> fields_;
    DateTexts dates_;
    QFont font_;
    std::vector<double> widths_; // of the texts
    QStringList texts_;
    double lineHeight_ = 1;
    double padding_ = 0;
    double y_ = 0; // where the next record goes
    int page_ = 0;
};

} // namespace

CsvExportResult ExportPdf(DbRecordset& source, const CsvExportOptions& options, QIODevice& device,
                          Progress* progress)
{
    using Ending = CsvExportResult::Ending;
    constexpr qint64 kRecordsPerStep = 64;
    CsvExportResult result;
    PdfTable table(device, options, source.Fields());
    if (!table.Begin(source)) {
        result.ending = Ending::WriteFailed;
        return result;
    }
    const bool read = source.Read({}, [&](std::span<const Cell> cells) {
        if (!table.Add(cells)) {
            result.ending = Ending::WriteFailed;
            return false;
        }
        ++result.records;
        if (progress && result.records % kRecordsPerStep == 0 && !progress->Advance(result.records)) {
            result.ending = Ending::Stopped;
            return false;
        }
        return true;
    });
    if (!read)
        result.ending = Ending::ReadFailed;
    if (!table.Finish())
        result.ending = Ending::WriteFailed;
    return result;
}

} // namespace mirel
