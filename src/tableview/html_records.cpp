#include "tableview/html_records.h"

#include "platform/number_text.h"

namespace mirel {
namespace {

constexpr std::string_view kStyle =
    "body{font-family:sans-serif;margin:1.5em}"
    "table{border-collapse:collapse}"
    "th,td{border:1px solid #8a939e;padding:.25em .5em;text-align:left;vertical-align:top;white-space:pre-wrap}"
    "th{background:#f5f6f8}"
    ".n{text-align:right}";

void AppendEscaped(std::string_view utf8, std::string& out)
{
    size_t from = 0;
    const auto put = [&](size_t at, std::string_view entity) {
        out += utf8.substr(from, at - from);
        out += entity;
        from = at + 1;
    };
    for (size_t at = 0; at < utf8.size(); ++at) {
        switch (utf8[at]) {
        case '&':
            put(at, "&amp;");
            break;
        case '<':
            put(at, "&lt;");
            break;
        case '>':
            put(at, "&gt;");
            break;
        default:
            break;
        }
    }
    out += utf8.substr(from);
}

} // namespace

HtmlRecords::HtmlRecords(const DateFormat& dates, YesNoWords words, std::span<const ResultField> fields)
    : yes_(words.yes.toStdString())
    , no_(words.no.toStdString())
    , dates_(dates)
    , fields_(fields)
{
}

void HtmlRecords::Begin(const QString& title, std::string& out) const
{
    out += "<!DOCTYPE html>\n<html>\n<head>\n<meta charset=\"utf-8\">\n<title>";
    AppendEscaped(title.toStdString(), out);
    out += "</title>\n<style>";
    out += kStyle;
    out += "</style>\n</head>\n<body>\n<table>\n<thead>\n<tr>";
    for (const ResultField& field : fields_) {
        out += IsNumber(field.type) ? "<th class=\"n\">" : "<th>";
        AppendEscaped(field.name.toStdString(), out);
        out += "</th>";
    }
    out += "</tr>\n</thead>\n<tbody>\n";
}

void HtmlRecords::Record(std::span<const Cell> cells, std::string& out)
{
    out += "<tr>";
    for (size_t i = 0; i < cells.size(); ++i) {
        out += IsNumber(fields_[i].type) ? "<td class=\"n\">" : "<td>";
        AppendCell(cells[i], fields_[i].type, out);
        out += "</td>";
    }
    out += "</tr>\n";
}

void HtmlRecords::End(std::string& out)
{
    out += "</tbody>\n</table>\n</body>\n</html>\n";
}

void HtmlRecords::AppendCell(const Cell& cell, FieldType type, std::string& out)
{
    switch (cell.kind) {
    case Cell::Kind::Null:
    case Cell::Kind::Binary:
        return;
    case Cell::Kind::Integer:
        if (type == FieldType::YesNo)
            out += cell.integer != 0 ? yes_ : no_;
        else
            out += NumberBuffer(cell.integer).Text();
        return;
    case Cell::Kind::Real:
        out += NumberBuffer(cell.real).Text();
        return;
    case Cell::Kind::Text: {
        const std::string_view date = type == FieldType::Date ? dates_.Of(cell.bytes) : std::string_view();
        AppendEscaped(date.empty() ? cell.bytes : date, out);
        return;
    }
    }
}

} // namespace mirel
