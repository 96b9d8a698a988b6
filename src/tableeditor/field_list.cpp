#include "tableeditor/field_list.h"

#include "data/field_names.h"
#include "resources/string_table.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>
#include <array>
#include <cmath>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qsizetype kLongestList = 4 << 20;

UserMessage Unreadable(const UserMessage& reason)
{
    return {Str::DesignListUnreadable, {reason.Text()}};
}

bool ReadName(const QJsonValue& value, ListedField& listed)
{
    listed.field.name = value.toString();
    return value.isString();
}

bool ReadType(const QJsonValue& value, ListedField& listed)
{
    listed.field.type = FieldTypeOfName(value.toString());
    return listed.field.type != FieldType::None;
}

bool ReadSize(const QJsonValue& value, ListedField& listed)
{
    const double size = value.toDouble(0.5);
    if (value.isNull())
        return true;
    listed.field.size = int(std::clamp(size, -1.0, double(kMaxTextSize) + 1)); // the rule of sizes refuses both
    return size == std::trunc(size);
}

bool ReadIndex(const QJsonValue& value, ListedField& listed)
{
    constexpr std::array kWords = {QStringView(u"NO"), QStringView(u"YES"), QStringView(u"ASC"),
                                   QStringView(u"DESC")};
    const QString word = value.toString();
    listed.field.index = IndexOrderOfWord(word);
    return std::ranges::any_of(kWords,
                               [&word](QStringView each) { return each.compare(word, Qt::CaseInsensitive) == 0; });
}

bool ReadWas(const QJsonValue& value, ListedField& listed)
{
    listed.was = value.toString();
    return value.isString() || value.isNull();
}

struct Member {
    QStringView name;
    bool (*read)(const QJsonValue& value, ListedField& listed);
    bool needed;
};
constexpr std::array kMembers = {
    Member{u"name", ReadName, true},    Member{u"type", ReadType, true}, Member{u"size", ReadSize, false},
    Member{u"index", ReadIndex, false}, Member{u"was", ReadWas, false},
};

// The name of the member that is not understood; empty: all are.
QString FaultyMember(const QJsonObject& object, ListedField& listed)
{
    for (const Member& member : kMembers) {
        const QJsonValue value = object.value(member.name);
        if (value.isUndefined() ? member.needed : !member.read(value, listed))
            return member.name.toString();
    }
    for (const QString& key : object.keys()) {
        if (std::ranges::none_of(kMembers, [&key](const Member& each) { return key == each.name; }))
            return key;
    }
    return {};
}

} // namespace

std::optional<std::vector<ListedField>> ReadFieldList(const QByteArray& json, UserMessage& fault)
{
    if (json.size() > kLongestList) {
        fault = Unreadable({Str::DesignListTooLong, {}});
        return {};
    }
    QJsonParseError error{};
    const QJsonDocument document = QJsonDocument::fromJson(json, &error);
    if (!document.isArray()) {
        const bool parses = error.error == QJsonParseError::NoError;
        fault = parses ? Unreadable({Str::DesignListNotAList, {}})
                       : UserMessage{Str::DesignListUnreadable, {error.errorString()}};
        return {};
    }
    std::vector<ListedField> fields;
    for (const QJsonValue& value : document.array()) {
        const QString place = QString::number(fields.size());
        if (!value.isObject()) {
            fault = Unreadable({Str::DesignListBadField, {place}});
            return {};
        }
        const QString member = FaultyMember(value.toObject(), fields.emplace_back());
        if (!member.isEmpty()) {
            fault = Unreadable({Str::DesignListBadMember, {place, member}});
            return {};
        }
    }
    return fields;
}

std::optional<std::vector<FieldDesign>> FieldsOfList(const std::vector<ListedField>& list,
                                                     const TableDesign* current, UserMessage& fault)
{
    const auto fieldOf = [current](const QString& name) -> const FieldDesign* {
        if (!current)
            return nullptr;
        const auto field = std::ranges::find_if(
            current->fields, [&name](const FieldDesign& each) { return SameDesignName(each.name, name); });
        return field == current->fields.end() ? nullptr : &*field;
    };
    std::vector<FieldDesign> fields;
    QStringList claimed;
    for (const ListedField& listed : list) {
        fields.push_back(listed.field);
        if (!listed.was || listed.was->isEmpty())
            continue;
        const FieldDesign* field = fieldOf(*listed.was);
        if (!field) {
            fault = current
                        ? UserMessage{Str::DesignListNoSuchField, {current->table, *listed.was, listed.field.name}}
                        : UserMessage{Str::DesignListNoTable, {*listed.was, listed.field.name}};
            return {};
        }
        if (claimed.contains(field->name)) {
            fault = {Str::DesignListFieldTwice, {field->name}};
            return {};
        }
        claimed += field->name;
        fields.back().was = field->name;
    }
    for (size_t i = 0; i < list.size(); ++i) {
        const FieldDesign* field = list[i].was ? nullptr : fieldOf(list[i].field.name);
        if (!field || claimed.contains(field->name))
            continue;
        claimed += field->name;
        fields[i].was = field->name;
    }
    return fields;
}

} // namespace mirel
