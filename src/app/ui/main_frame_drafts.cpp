#include "app/ui/drafts_dialog.h"
#include "app/ui/main_frame.h"
#include "app/ui/view_tabs.h"
#include "app/ui/view_window.h"
#include "data/db_recordset.h"
#include "forms/ui/form_eng_view.h"
#include "resources/string_table.h"
#include "tableview/ui/table_view.h"

#include <QApplication>
#include <QDir>
#include <QLabel>

// What is being typed is kept beside the profile, and offered again after the program was killed.

namespace mirel {
namespace {

constexpr int kKeepDraftsMs = 700; // after the first key: a second at most may be lost
constexpr int kOfferAgainMs = 300; // while a dialog is open

} // namespace

void CMainFrame::FollowTyping(HostedView& view)
{
    connect(&view, &HostedView::typed, this, [this, &view] {
        if (!view.HasEdits())
            KeepDrafts(); // it is saved or given up
        else if (!draftTimer_.isActive())
            draftTimer_.start(kKeepDraftsMs);
    });
    connect(&view, &HostedView::closed, this, &CMainFrame::KeepDrafts);
}

void CMainFrame::KeepDrafts()
{
    draftTimer_.stop();
    std::vector<Draft> drafts;
    const auto add = [&](const ViewKey& key, HostedView* view) {
        std::optional<RecordDraft> typed = view && !key.design ? view->Draft() : std::nullopt;
        if (typed)
            drafts.push_back(
                {session_.Location().Text(), session_.Stamp(), {key.kind, key.name}, std::move(*typed)});
    };
    for (int tab = 0; tab < tabs_->Count(); ++tab)
        add(tabs_->KeyAt(tab), tabs_->ViewAt(tab));
    for (CViewWindow* window : Windows())
        add(window->Key(), window->View());
    if (!drafts_.Keep(drafts) && !std::exchange(saidDraftsFail_, true))
        Note(StringText(Str::DraftsNotKept, {QDir::toNativeSeparators(drafts_.FaultyPath())}));
}

// --- what a killed process left behind ----------------------------------------------------------------------

void CMainFrame::OfferDrafts()
{
    if (!session_.IsOpen() || !isVisible() || session_.Folder().profileAccess == Profile::Access::ReadOnly)
        return;
    if (QApplication::activeModalWidget()) {
        QTimer::singleShot(kOfferAgainMs, this, &CMainFrame::OfferDrafts);
        return;
    }
    drafts_.TakeLeft(session_.Location().Text());
    if (!drafts_.Damaged().isEmpty())
        Note(StringText(Str::DraftsDamaged, {QDir::toNativeSeparators(drafts_.Damaged().first())}));
    std::vector<LeftDraft> left;
    for (size_t i = 0; i < drafts_.Left().size();) {
        const DraftState state = StateOf(drafts_.Left()[i], session_);
        if (state == DraftState::Saved && drafts_.DropLeft(i))
            continue;
        left.push_back({drafts_.Left()[i++], state});
    }
    if (!left.empty()) {
        const auto drop = [this](size_t index) {
            return drafts_.DropLeft(index) ? QString()
                                           : StringText(Str::DraftsNotKept, {session_.Folder().DraftsFolder()});
        };
        CDraftsDialog dialog(std::move(left),
                             {.putBack =
                                  [this, drop](size_t index) {
                                      const QString whyNot = PutBack(drafts_.Left()[index]);
                                      return whyNot.isEmpty() ? drop(index) : whyNot;
                                  },
                              .discard = drop,
                              .words = settings_.Words()},
                             this);
        dialog.exec();
    }
    drafts_.GiveBack();
}

// An empty text when it is typed again; else why not.
QString CMainFrame::PutBack(const Draft& draft)
{
    HostedView* view = draft.view.kind == EntryKind::Form ? FormForDraft(draft) : TableForDraft(draft);
    if (!view)
        return StringText(Str::DraftNoView, {draft.view.name});
    if (view->HasEdits() && view->Draft() != draft.typed)
        return StringText(Str::DraftViewBusy, {draft.view.name});
    if (!view->HasEdits() && !view->PutBack(draft.typed))
        return StringText(Str::DraftChanged);
    KeepDrafts(); // now it is this process's
    return {};
}

HostedView* CMainFrame::TableForDraft(const Draft& draft)
{
    std::optional<TableRequest> request = commands_.RequestOf(draft.view);
    if (!OnlyReads(draft.typed.statement))
        return nullptr;
    if (!request || request->statement != draft.typed.statement) // a query that was opened in the view, or changed
        request = TableRequest{draft.view.name, draft.typed.statement, {}, draft.view.kind};
    return OpenTable(*request);
}

// The form, if it is open already; otherwise it opens with the records that it showed then.
HostedView* CMainFrame::FormForDraft(const Draft& draft)
{
    if (tabs_->BringForward(draft.view)) {
        HostedView* open = tabs_->Front();
        if (open && !open->HasEdits() && open->PutBack(draft.typed))
            return open;
    }
    std::optional<FormCall> call = commands_.CallOfForm(draft.view.name);
    if (!call || (!draft.typed.statement.isEmpty() && !OnlyReads(draft.typed.statement)))
        return nullptr;
    call->query = draft.typed.statement;
    return OpenForm(*call);
}

// A setting is written as it is: once, when the window has shown for a moment.
void CMainFrame::TellWhereNothingIsKept()
{
    if (std::exchange(triedSettings_, true) || session_.Folder().profileAccess == Profile::Access::ReadOnly)
        return;
    if (!settings_.SetInt(Setting::OpenByDoubleClick, state_.OpensByDoubleTap() ? 1 : 0))
        Note(StringText(Str::SettingsNotKept, {QDir::toNativeSeparators(session_.Folder().ProfileFile())}));
}

void CMainFrame::Note(const QString& text)
{
    constexpr int kShownMs = 12'000;
    notice_->setText(text);
    notice_->show();
    QTimer::singleShot(kShownMs, this, [this, text] {
        if (notice_->text() == text)
            notice_->hide();
    });
}

} // namespace mirel
