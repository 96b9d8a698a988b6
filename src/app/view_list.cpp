#include "app/view_list.h"

#include <QUrl>

#include <algorithm>

namespace mirel {
namespace {

constexpr qsizetype kMostViews = 200; // of a profile that somebody damaged

const QString kDesign = QStringLiteral("design:");

MainTab TabOf(EntryKind kind)
{
    switch (kind) {
    case EntryKind::Table:
        return MainTab::Table;
    case EntryKind::Form:
        return MainTab::Form;
    case EntryKind::Query:
        break;
    }
    return MainTab::Query;
}

} // namespace

QString ViewListText(const ViewList& views)
{
    QStringList words{QString::number(views.front)};
    for (const ViewKey& view : views.views) {
        const QString text = FavoriteText({view.kind, view.name, {}, false});
        words += QString::fromLatin1(QUrl::toPercentEncoding(view.design ? kDesign + text : text));
    }
    return words.join(u' ');
}

ViewList ReadViewList(QStringView text)
{
    ViewList views;
    const QList<QStringView> words = text.split(u' ', Qt::SkipEmptyParts);
    bool isNumber = false;
    const int front = words.value(0).toInt(&isNumber);
    for (qsizetype i = 1; isNumber && i < std::min(words.size(), kMostViews); ++i) {
        const QString word = QUrl::fromPercentEncoding(words[i].toUtf8());
        const bool design = word.startsWith(kDesign);
        const std::optional<MainEntry> entry = FavoriteOfText(design ? word.sliced(kDesign.size()) : word);
        if (!entry)
            continue;
        const ViewKey view{entry->kind, entry->name, design};
        if (std::ranges::find(views.views, view) != views.views.end())
            continue;
        views.views.push_back(view);
        if (front == i - 1)
            views.front = int(views.views.size()) - 1;
    }
    return views;
}

ViewList StillThere(const ViewList& views, const MainViewState& state)
{
    ViewList found;
    for (size_t i = 0; i < views.views.size(); ++i) {
        const std::vector<MainEntry>& entries = state.Entries(TabOf(views.views[i].kind));
        if (std::ranges::find(entries, views.views[i].name, &MainEntry::name) == entries.end())
            continue;
        if (int(i) == views.front)
            found.front = int(found.views.size());
        found.views.push_back(views.views[i]);
    }
    return found;
}

} // namespace mirel
