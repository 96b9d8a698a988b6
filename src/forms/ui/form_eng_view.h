#pragma once

#include "forms/running_form.h"
#include "forms/ui/form_command.h"

#include "platform/ui/hosted_view.h"

#include <QBasicTimer>

class QAction;
class QMenu;
class QScrollArea;
class QStackedWidget;
class QToolBar;
class QTreeWidget;

namespace mirel {

class CommandActions;
class ErrorLine;
class FilterBar;
class FormSurface;
class RecordList;

// What a form is run in. All of it must outlive the view.
struct FormSurroundings {
    DbConnection& connection;
    DatabaseLocation database;
    const FormStore& store;
    UserPrompt& prompt;
    FormViewSettings settings;
    QString activeTable; // as in FormEnvironment
};

// The form engine's view: the surface of a running form, with its menus, tool bar and keys. Behaviour is the
// running form's; the view shows its state and hands it the user's actions.
//
// Closing asks about unsaved changes, and the view stays when the user says No. A form that is done closes its
// view by itself, after the call that ended it.
class CFormEngView : public HostedView, private FormHost {
    Q_OBJECT

public:
    CFormEngView(const FormCall& call, const FormSurroundings& surroundings, QWidget* parent = nullptr);
    ~CFormEngView() override;

    // Opens the form's first result. False when that failed; why was told then, and the form runs without one.
    bool Open();

    const RunningForm& Form() const { return form_; }
    FormSurface& Surface() { return *surface_; }
    QSize PreferredSize() const override;
    QList<QMenu*> Menus() const override { return menus_; }
    QList<KeyHint> Keys() const override;
    bool MayClose() override;
    void GiveUpEdits() override;
    void TakeUpChanges() override;
    bool IsSettled() const override { return !form_.IsBehind(); }
    std::optional<RecordDraft> Draft() override;
    bool PutBack(const RecordDraft& draft) override;
    void ChangeSettings(const FormViewSettings& settings);
    // When others have changed the structure of what it shows.
    void RunAgain();

Q_SIGNALS:
    void editRequested();                                          // the form itself is to be changed
    void formCalled(const mirel::FormCall& call);                  // CALL FORM: to run in a view of its own
    void dataChanged();                                            // data of the database are not what they were
    void settingsChanged(const mirel::FormViewSettings& settings); // by the user; in force here already

protected:
    void closeEvent(QCloseEvent* event) override;
    void changeEvent(QEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    void CallForm(const FormCall& call) override;
    void CloseForm() override;
    void DataChanged() override;

    void CreateActions();
    void CreateToolBar();
    void LayOut();
    QAction* ActionOf(FormCommand id) const;

    struct Commands;
    void ShowState();
    void ShowActions();
    // What is wrong with the first text that cannot be stored; not with the one that is being typed.
    void ShowReason();
    // The form itself, all fields of its record, or all its records.
    enum class Page { Form, Detail, List };
    Page CurrentPage() const;
    void ShowPage(Page page);
    void ShowDetail();
    void ShowList();
    void SortByHeader(int field);
    void FitSurface();
    void BeginAtTop();
    void ShowControl(QWidget& control);
    void Scroll(int steps);
    bool HasScrollBar() const;
    void ShowScrollBar(bool shown);
    void Copy();
    void Paste();
    void ChooseOptions();
    void ShowPopup(int control, const QPoint& globalPosition);
    int CommandControl() const { return popupControl_ >= 0 ? popupControl_ : lastFocused_; }

    RunningForm form_;
    CommandActions* actions_ = nullptr;
    QList<QMenu*> menus_;
    QStackedWidget* stack_;
    QScrollArea* scroller_;
    FormSurface* surface_;
    QTreeWidget* detail_;
    RecordList* list_;
    QToolBar* toolBar_ = nullptr;
    FilterBar* filters_ = nullptr;
    ErrorLine* error_;
    int refusedControl_ = -1; // that the error is about
    QBasicTimer clock_;
    QBasicTimer catchUp_;
    int sortedField_ = -1; // of the list, by its header; -1: none
    bool sortedDescending_ = false;
    int lastFocused_ = -1;  // outlives the focus's way through a menu
    int popupControl_ = -1; // while its popup menu is open
    bool closing_ = false;
    bool wasDirty_ = false; // when it was shown last
};

} // namespace mirel
