#include "app/draft.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kVersion = 1;
constexpr int kMostPlaces = 100'000; // of a form's controls or a result's fields

QJsonObject ObjectOf(const TypedText& typed)
{
    return {
        {u"place"_s, typed.place}, {u"name"_s, typed.name}, {u"text"_s, typed.text}, {u"tick"_s, typed.isTick}};
}

QJsonObject ObjectOf(const Draft& draft)
{
    QJsonArray texts;
    for (const TypedText& typed : draft.typed.texts)
        texts += ObjectOf(typed);
    return {{u"database"_s, draft.database},
            {u"stamp"_s, draft.stamp},
            {u"view"_s, FavoriteText({draft.view.kind, draft.view.name, {}, false})},
            {u"statement"_s, draft.typed.statement},
            {u"record"_s, QString::fromLatin1(draft.typed.record.Key().toHex())},
            {u"fingerprint"_s, QString::fromLatin1(draft.typed.fingerprint)},
            {u"texts"_s, texts}};
}

std::optional<TypedText> TypedOf(const QJsonObject& object)
{
    const QJsonValue place = object[u"place"];
    const TypedText typed{place.toInt(-1), object[u"name"].toString(), object[u"text"].toString(),
                          object[u"tick"].toBool()};
    const bool reads =
        typed.place >= 0 && typed.place <= kMostPlaces && object[u"name"].isString() && object[u"text"].isString();
    return reads ? std::optional(typed) : std::nullopt;
}

std::optional<Draft> DraftOf(const QJsonObject& object)
{
    Draft draft;
    draft.database = object[u"database"].toString();
    draft.stamp = object[u"stamp"].toString();
    draft.typed.statement = object[u"statement"].toString();
    draft.typed.record = RecordId(QByteArray::fromHex(object[u"record"].toString().toLatin1()));
    draft.typed.fingerprint = object[u"fingerprint"].toString().toLatin1();
    for (const QJsonValue& each : object[u"texts"].toArray()) {
        const std::optional<TypedText> typed = TypedOf(each.toObject());
        if (!typed)
            return {};
        draft.typed.texts.push_back(*typed);
    }
    const std::optional<MainEntry> view = FavoriteOfText(object[u"view"].toString());
    if (!view || draft.database.isEmpty() || draft.typed.texts.empty())
        return {};
    draft.view = {view->kind, view->name};
    return draft;
}

} // namespace

QByteArray DraftsFile(const std::vector<Draft>& drafts)
{
    QJsonArray array;
    for (const Draft& draft : drafts)
        array += ObjectOf(draft);
    return QJsonDocument(QJsonObject{{u"version"_s, kVersion}, {u"drafts"_s, array}})
        .toJson(QJsonDocument::Compact);
}

DraftsRead ReadDraftsFile(const QByteArray& file)
{
    const QJsonObject whole = QJsonDocument::fromJson(file).object();
    const int version = whole[u"version"].toInt(0);
    if (version > kVersion)
        return {DraftsRead::Outcome::Newer, {}};
    DraftsRead read;
    if (version < 1 || !whole[u"drafts"].isArray())
        return read;
    read.outcome = DraftsRead::Outcome::Read;
    for (const QJsonValue& each : whole[u"drafts"].toArray()) {
        if (const std::optional<Draft> draft = DraftOf(each.toObject()))
            read.drafts.push_back(*draft);
        else
            read.outcome = DraftsRead::Outcome::Damaged;
    }
    return read;
}

} // namespace mirel
