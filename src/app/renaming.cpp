#include "app/renaming.h"

#include "resources/string_table.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr size_t kUsesListed = 8;

std::optional<EntryKind> EntryOf(NameChange::What what)
{
    switch (what) {
    case NameChange::What::Table:
        return EntryKind::Table;
    case NameChange::What::Form:
        return EntryKind::Form;
    case NameChange::What::Query:
        return EntryKind::Query;
    case NameChange::What::Field:
        break;
    }
    return {};
}

// As the favorites name it; empty for a field, which is none.
QString FavoriteOf(NameChange::What what, const QString& name)
{
    const std::optional<EntryKind> kind = EntryOf(what);
    return kind ? FavoriteText({*kind, name, {}, false}) : QString();
}

QString LineOf(const NameUse& use)
{
    const Str text = use.holder == NameUse::Holder::Form ? Str::RenameUseInForm : Str::RenameUseInQuery;
    return StringText(text, {use.name, QString::number(use.places)});
}

// One after the other; several first take names that nothing bears, so that none is taken for another's old one.
bool MendAll(FormStore& store, const std::vector<NameChange>& changes)
{
    if (changes.size() == 1)
        return !MendNames(store, changes.front()).empty();
    const auto between = [](size_t i) { return u"mirel_renaming_%1"_s.arg(i); };
    bool any = false;
    for (size_t i = 0; i < changes.size(); ++i)
        any = !MendNames(store, {changes[i].what, changes[i].table, changes[i].from, between(i)}).empty() || any;
    for (size_t i = 0; i < changes.size(); ++i)
        MendNames(store, {changes[i].what, changes[i].table, between(i), changes[i].to});
    return any;
}

template <typename Record>
void RenameRecord(Record* record, const QString& newName)
{
    if (record)
        record->SetName(newName);
}

} // namespace

bool Renaming::MendsFavorites(const NameChange& change) const
{
    return session_.Favorites().contains(FavoriteOf(change.what, change.from));
}

void Renaming::MendFavorites(const NameChange& change)
{
    QStringList favorites = session_.Favorites();
    std::ranges::replace(favorites, FavoriteOf(change.what, change.from), FavoriteOf(change.what, change.to));
    if (!session_.SetFavorites(favorites))
        session_.Prompt().Show({Str::FavoritesReadOnly, {}});
}

Renaming::Choice Renaming::Ask(const NameChange& change)
{
    FormStore copy = session_.Store();
    const std::vector<NameUse> uses = MendNames(copy, change);
    QStringList lines;
    for (const NameUse& use : std::span(uses).first(std::min(uses.size(), kUsesListed)))
        lines += LineOf(use);
    if (uses.size() > kUsesListed)
        lines += StringText(Str::RenameMoreUses, {QString::number(uses.size() - kUsesListed)});
    if (MendsFavorites(change))
        lines += StringText(Str::RenameUseInFavorites);
    if (lines.isEmpty())
        return Choice::Mend;
    const UserMessage question{Str::RenameMendQuestion, {change.from, lines.join(u"\r\n"_s), change.to}};
    switch (session_.Prompt().AskYesNoOr(question, {Str::RenameAlone, {}})) {
    case UserPrompt::Answer::Yes:
        return Choice::Mend;
    case UserPrompt::Answer::Third:
        return Choice::RenameAlone;
    case UserPrompt::Answer::No:
        break;
    }
    return Choice::Cancel;
}

bool Renaming::Rename(const NameChange& change, const std::function<bool(const DesignRun::LastStep& last)>& rename)
{
    const Choice choice = Ask(change);
    if (choice == Choice::Cancel)
        return false;
    if (choice == Choice::RenameAlone)
        return rename({});
    const bool renamed = RenameAndMend({change}, rename);
    if (renamed && MendsFavorites(change))
        MendFavorites(change);
    return renamed;
}

bool Renaming::RenameAndMend(const std::vector<NameChange>& changes,
                             const std::function<bool(const DesignRun::LastStep& last)>& rename)
{
    if (changes.empty() || session_.Store().Path().isEmpty())
        return rename({});
    bool mended = false;
    bool failed = false;
    FormStore before;
    const bool renamed = rename([&] {
        mended = session_.Store().Apply([&](FormStore& store) {
            before = store;
            return MendAll(store, changes);
        });
        failed = !mended && !session_.Store().LastError().isEmpty();
        return !failed;
    });
    if (failed)
        session_.Prompt().ShowError(session_.Store().LastError());
    // The database took its part back at the last moment.
    if (!renamed && mended) {
        (void)session_.Store().Apply([&](FormStore& store) {
            store.Forms() = before.Forms();
            store.Queries() = before.Queries();
            return true;
        });
    }
    return renamed;
}

bool Renaming::CheckName(EntryKind kind, const QString& name, const QString& newName)
{
    UserPrompt& prompt = session_.Prompt();
    const bool isForm = kind == EntryKind::Form;
    if (newName.isEmpty()) {
        prompt.Show({isForm ? Str::RenameFormNameMissing : Str::RenameQueryNameMissing, {}});
        return false;
    }
    if (!std::ranges::all_of(newName, [](QChar each) { return each.isPrint(); })) {
        prompt.Show({Str::DesignNameUnusable, {newName}});
        return false;
    }
    if (newName.size() > kMaxNameLength) {
        prompt.Show({Str::DesignNameTooLong, {newName, QString::number(kMaxNameLength)}});
        return false;
    }
    const FormStore& store = session_.Store();
    const bool isTaken = isForm ? store.FindForm(newName) != nullptr : store.FindQuery(newName) != nullptr;
    const bool isThere = isForm ? store.FindForm(name) != nullptr : store.FindQuery(name) != nullptr;
    if (isTaken || !isThere)
        prompt.Show({isTaken ? Str::RenameTaken : Str::RenameGone, {isTaken ? newName : name}});
    return !isTaken && isThere;
}

bool Renaming::RenameInStore(EntryKind kind, const QString& name, const QString& newName)
{
    const QString trimmed = newName.trimmed();
    if (trimmed == name)
        return true;
    const bool isForm = kind == EntryKind::Form;
    const NameChange change{isForm ? NameChange::What::Form : NameChange::What::Query, {}, name, trimmed};
    if (!CheckName(kind, name, trimmed))
        return false;
    const Choice choice = Ask(change);
    if (choice == Choice::Cancel)
        return false;
    bool isFree = true;
    const bool renamed = session_.Store().Apply([&](FormStore& store) {
        // Another program may have been there meanwhile.
        isFree = isForm ? store.FindForm(name) && !store.FindForm(trimmed)
                        : store.FindQuery(name) && !store.FindQuery(trimmed);
        if (!isFree)
            return false;
        if (choice == Choice::Mend)
            MendNames(store, change);
        if (isForm)
            RenameRecord(store.FindForm(name), trimmed);
        else
            RenameRecord(store.FindQuery(name), trimmed);
        return true;
    });
    if (!renamed) {
        if (isFree)
            session_.Prompt().ShowError(session_.Store().LastError());
        else
            (void)CheckName(kind, name, trimmed);
        return false;
    }
    if (choice == Choice::Mend && MendsFavorites(change))
        MendFavorites(change);
    return true;
}

} // namespace mirel
