#include "app/window_options.h"

#include <QCommandLineParser>
#include <QRegularExpression>

#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// One option: its name, what its value is called (empty: it has none), what it does, where it goes.
struct OptionDef {
    QStringView name;
    QStringView value;
    QStringView help;
    QString WindowOptions::*text;
    bool WindowOptions::*flag;
};

const std::array kOptions = {
    OptionDef{u"home", u"DIR", u"the program folder: side files, favorites, profile, sample", &WindowOptions::home,
              nullptr},
    OptionDef{u"palette", u"own|light|dark|desktop", u"the program's own look, or the desktop's",
              &WindowOptions::palette, nullptr},
    OptionDef{u"language", u"CODE", u"the language of the window, such as de or en", &WindowOptions::language,
              nullptr},
    OptionDef{u"sample", u"", u"open the sample database, and make it first where it is not there", nullptr,
              &WindowOptions::sample},
    OptionDef{u"picture", u"FILE", u"write a picture of the window to a PNG file and end", &WindowOptions::picture,
              nullptr},
    OptionDef{u"size", u"WxH", u"size of that picture; 1100x700 unless given", nullptr, nullptr},
    OptionDef{u"table", u"NAME", u"open that table alone; with --picture, show it there", &WindowOptions::table,
              nullptr},
    OptionDef{u"form", u"NAME", u"the same with that form", &WindowOptions::form, nullptr},
    OptionDef{u"query", u"NAME", u"the same with that saved query", &WindowOptions::query, nullptr},
    OptionDef{u"print-sample-path", u"", u"print where the sample database is, making it where it is not there",
              nullptr, &WindowOptions::printSamplePath},
    OptionDef{u"help", u"", u"print this", nullptr, &WindowOptions::help},
    OptionDef{u"version", u"", u"print the version", nullptr, &WindowOptions::version},
};

constexpr int kLargestSide = 20'000;

std::optional<QSize> SizeOf(const QString& text)
{
    static const QRegularExpression form(u"^(\\d{1,5})x(\\d{1,5})$"_s);
    const QRegularExpressionMatch match = form.match(text);
    const QSize size(match.captured(1).toInt(), match.captured(2).toInt());
    if (!match.hasMatch() || size.isEmpty() || size.width() > kLargestSide || size.height() > kLargestSide)
        return std::nullopt;
    return size;
}

void AddOptions(QCommandLineParser& parser)
{
    for (const OptionDef& option : kOptions)
        parser.addOption({option.name.toString(), option.help.toString(), option.value.toString()});
}

bool ReadOptions(const QCommandLineParser& parser, WindowOptions& options, QString& complaint)
{
    for (const OptionDef& option : kOptions) {
        const QString name = option.name.toString();
        if (option.text)
            options.*option.text = parser.value(name);
        if (option.flag)
            options.*option.flag = parser.isSet(name);
    }
    static const QStringList palettes = {{}, u"own"_s, u"light"_s, u"dark"_s, u"desktop"_s};
    if (!palettes.contains(options.palette)) {
        complaint = u"--palette is own, light, dark or desktop, not \"%1\""_s.arg(options.palette);
        return false;
    }
    static const QRegularExpression language(u"^[A-Za-z]{2,3}([_-][A-Za-z0-9]{1,8}){0,3}$"_s);
    if (!options.language.isEmpty() && !language.match(options.language).hasMatch()) {
        complaint = u"--language is a code such as de or pt-BR, not \"%1\""_s.arg(options.language);
        return false;
    }
    if (parser.isSet(u"size"_s)) {
        const std::optional<QSize> size = SizeOf(parser.value(u"size"_s));
        if (!size) {
            complaint = u"--size is WIDTHxHEIGHT, not \"%1\""_s.arg(parser.value(u"size"_s));
            return false;
        }
        options.size = *size;
    }
    const int views = int(!options.table.isEmpty()) + int(!options.form.isEmpty()) + int(!options.query.isEmpty());
    if (views > 1) {
        complaint = u"one of --table, --form and --query at a time"_s;
        return false;
    }
    return true;
}

} // namespace

std::optional<WindowOptions> ParseWindowOptions(const QStringList& arguments, QString& complaint)
{
    QCommandLineParser parser;
    AddOptions(parser);
    WindowOptions options;
    if (!parser.parse(QStringList(u"mirel"_s) + arguments)) {
        complaint = parser.errorText();
        return std::nullopt;
    }
    const QStringList positional = parser.positionalArguments();
    if (positional.size() > 1) {
        complaint = u"one database at a time, \"%1\" is too many"_s.arg(positional[1]);
        return std::nullopt;
    }
    options.database = positional.value(0);
    if (!ReadOptions(parser, options, complaint))
        return std::nullopt;
    return options;
}

QString WindowOptionsHelp()
{
    QString help = u"mirel [OPTIONS] [DATABASE]\n\n"_s;
    for (const OptionDef& option : kOptions) {
        const QString left =
            option.value.isEmpty() ? option.name.toString() : u"%1 %2"_s.arg(option.name, option.value);
        help += u"  --%1  %2\n"_s.arg(left.leftJustified(20), option.help);
    }
    return help;
}

} // namespace mirel
