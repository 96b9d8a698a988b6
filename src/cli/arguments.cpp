#include "cli/arguments.h"

#include "cli/command.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

constexpr qsizetype kOptionWidth = 26;
constexpr qsizetype kCommandWidth = 34;

QString FromAscii(const char* text)
{
    return QString::fromLatin1(text);
}

// What the option's value may be, as the help shows it.
QString ValueOf(const OptionDef& option, const CommandDef* command)
{
    return FromAscii(option.kind == ValueKind::Format && command ? command->formats : option.value);
}

bool IsTakenBy(const CommandDef* command, Opt option)
{
    constexpr std::array kEverywhere = {Opt::Home, Opt::Help, Opt::Timing};
    if (std::ranges::find(kEverywhere, option) != kEverywhere.end())
        return true;
    return command ? std::ranges::find(command->options, option) != command->options.end()
                   : option == Opt::Version;
}

// The commands of a group are two words: "forms list" belongs to "forms".
bool IsOfGroup(const CommandDef& command, const QString& group)
{
    return FromAscii(command.name).startsWith(group + u' ');
}

bool IsGroup(const QString& word)
{
    return std::ranges::any_of(Commands(), [&word](const CommandDef& each) { return IsOfGroup(each, word); });
}

// "-7" and "-.5" are values, and so is a lone "-".
bool LooksLikeOption(const QString& word)
{
    return word.size() > 1 && word[0] == u'-' && word[1] != u'.' && !(word[1] >= u'0' && word[1] <= u'9');
}

class Parser {
public:
    Parser(const QStringList& words, ArgumentFault& fault)
        : words_(words)
        , fault_(fault)
    {
    }

    std::optional<Arguments> Parse()
    {
        while (at_ < words_.size()) {
            const QString word = words_[at_++];
            if (word == u"--"_s && !onlyArguments_)
                onlyArguments_ = true;
            else if (!onlyArguments_ && LooksLikeOption(word) ? !TakeOption(word) : !TakeArgument(word))
                return {};
        }
        return IsComplete() ? std::optional(arguments_) : std::nullopt;
    }

private:
    bool Refuse(Str message, const QStringList& arguments = {})
    {
        fault_ = {StringText(message, arguments),
                  arguments_.command ? FromAscii(arguments_.command->name) : arguments_.group};
        return false;
    }

    bool TakeOption(const QString& word)
    {
        const qsizetype equals = word.indexOf(u'=');
        const QString name = word.left(equals);
        const OptionDef* option = FindOption(name);
        if (!option)
            return Refuse(Str::CliUnknownOption, {name});
        QString value;
        if (option->kind == ValueKind::Flag) {
            if (equals >= 0)
                return Refuse(Str::CliFlagTakesNoValue, {name});
        } else if (equals >= 0) {
            value = word.mid(equals + 1);
        } else if (at_ < words_.size()) {
            value = words_[at_++];
        } else {
            return Refuse(Str::CliValueMissing, {name, FromAscii(option->value)});
        }
        if (!IsValidValue(option->kind, value))
            return Refuse(Str::CliValueWrong, {value, name, FromAscii(option->value)});
        arguments_.options.push_back({option->id, value});
        return true;
    }

    bool TakeArgument(const QString& word)
    {
        if (arguments_.command) {
            arguments_.positional += word;
            return true;
        }
        if (arguments_.group.isEmpty() && IsGroup(word)) {
            arguments_.group = word;
            return true;
        }
        const QString name = arguments_.group.isEmpty() ? word : arguments_.group + u' ' + word;
        arguments_.command = FindCommand(name);
        return arguments_.command ? true : Refuse(Str::CliUnknownCommand, {name});
    }

    bool IsFormatHere(const Arguments::Given& given)
    {
        const OptionDef& option = DefinitionOf(given.option);
        if (option.kind != ValueKind::Format)
            return true;
        const QString formats = ValueOf(option, arguments_.command);
        return formats.split(u'|').contains(given.value) ||
               Refuse(Str::CliValueWrong, {given.value, FromAscii(option.name), formats});
    }

    bool IsComplete()
    {
        for (const Arguments::Given& given : arguments_.options) {
            if (!IsTakenBy(arguments_.command, given.option))
                return Refuse(Str::CliOptionNotHere, {FromAscii(DefinitionOf(given.option).name)});
            if (!IsFormatHere(given))
                return false;
        }
        if (arguments_.Has(Opt::Help) || arguments_.Has(Opt::Version))
            return true;
        if (!arguments_.command)
            return Refuse(arguments_.group.isEmpty() ? Str::CliCommandMissing : Str::CliGroupCommandMissing,
                          {arguments_.group});
        const ArgumentCount allowed = ArgumentCountOf(*arguments_.command);
        const qsizetype given = arguments_.positional.size();
        if (given < allowed.least)
            return Refuse(Str::CliArgumentsMissing, {FromAscii(arguments_.command->arguments)});
        if (given > allowed.most)
            return Refuse(Str::CliArgumentTooMany, {arguments_.positional[allowed.most]});
        for (const Opt needed : arguments_.command->needed) {
            if (!arguments_.Has(needed))
                return Refuse(Str::CliOptionNeeded, {FromAscii(DefinitionOf(needed).name)});
        }
        return true;
    }

    const QStringList& words_;
    ArgumentFault& fault_;
    qsizetype at_ = 0;
    bool onlyArguments_ = false;
    Arguments arguments_;
};

QString HelpLine(const QString& left, qsizetype width, const QString& right)
{
    return u"  "_s + left.leftJustified(width) + u"  "_s + right + u'\n';
}

QString OptionLine(Opt id, const CommandDef* command = nullptr)
{
    const OptionDef& option = DefinitionOf(id);
    const QString left = (FromAscii(option.name) + u' ' + ValueOf(option, command)).trimmed();
    return HelpLine(left, kOptionWidth, FromAscii(option.help));
}

QString CommandLine(const CommandDef& command)
{
    return (FromAscii(command.name) + u' ' + FromAscii(command.arguments)).trimmed();
}

QString OptionLines(std::initializer_list<Opt> options)
{
    QString lines;
    for (const Opt option : options)
        lines += OptionLine(option);
    return lines + HelpLine(u"--"_s, kOptionWidth, u"ends the options: the words after it are values"_s);
}

// Of the program, or of one group.
QString CommandsHelp(const QString& group)
{
    QString help = group.isEmpty() ? StringText(Str::CliUsage) : StringText(Str::CliGroupUsage, {group});
    help += u"\n\n"_s;
    for (const CommandDef& command : Commands()) {
        if (group.isEmpty() || IsOfGroup(command, group))
            help += HelpLine(CommandLine(command), kCommandWidth, FromAscii(command.help));
    }
    help += u'\n';
    return help + (group.isEmpty() ? OptionLines({Opt::Home, Opt::Timing, Opt::Help, Opt::Version})
                                   : OptionLines({Opt::Home, Opt::Timing, Opt::Help}));
}

QString CommandHelp(const CommandDef& command)
{
    QString help = u"mirel-cli "_s + CommandLine(command);
    for (const Opt needed : command.needed) {
        const OptionDef& option = DefinitionOf(needed);
        help += u' ' + (FromAscii(option.name) + u' ' + FromAscii(option.value)).trimmed();
    }
    help += u"\n\n"_s + FromAscii(command.help) + u"\n\n"_s;
    for (const Opt option : command.options)
        help += OptionLine(option, &command);
    return help + OptionLines({Opt::Home, Opt::Timing, Opt::Help});
}

} // namespace

bool Arguments::Has(Opt option) const
{
    return std::ranges::find(options, option, &Given::option) != options.end();
}

QString Arguments::Text(Opt option, const QString& otherwise) const
{
    const auto last = std::find_if(options.rbegin(), options.rend(),
                                   [option](const Given& given) { return given.option == option; });
    return last == options.rend() ? otherwise : last->value;
}

qint64 Arguments::Count(Opt option, qint64 otherwise) const
{
    return Has(option) ? Text(option).toLongLong() : otherwise;
}

char16_t Arguments::Character(Opt option, char16_t otherwise) const
{
    return Has(option) ? CharacterOf(DefinitionOf(option).kind, Text(option)).value_or(otherwise) : otherwise;
}

std::optional<Arguments> ParseArguments(const QStringList& words, ArgumentFault& fault)
{
    return Parser(words, fault).Parse();
}

QString HelpFor(const Arguments& arguments)
{
    return arguments.command ? CommandHelp(*arguments.command) : CommandsHelp(arguments.group);
}

} // namespace mirel::cli
