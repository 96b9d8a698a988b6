#pragma once

#include "forms/design/expression_desk.h"
#include "forms/design/form_maker.h"
#include "forms/form_host.h"
#include "forms/ui/property_editors.h"
#include "platform/ui/hosted_view.h"

#include <QBasicTimer>

class QLabel;
class QListWidget;
class QMenu;
class QScrollArea;
class QToolBar;

namespace mirel {

class CommandActions;
class DesignSurface;
class ElidedLabel;
class PropertySheet;

// What a form maker is used in. All of it must outlive the view.
struct FormMakSurroundings {
    MakerSurroundings maker;
    MakerDialogs dialogs;
    YesNoWords words;
    int holdTimeMs = 0;
};

// The form maker's view: the design surface with its palette of controls, the table's fields and the property
// sheet beside it where there is room. What it does is the form maker's; the view hands it the user's actions.
//
// Its menus follow the selection: one set for no control, one for one, one for several; File is always there.
class CFormMakView : public HostedView {
    Q_OBJECT

public:
    CFormMakView(FormDef form, FormMaker::Start start, FormMakSurroundings surroundings,
                 QWidget* parent = nullptr);
    ~CFormMakView() override;

    FormMaker& Maker() { return maker_; }
    DesignSurface& Surface() { return *surface_; }

    QSize PreferredSize() const override;
    QList<QMenu*> Menus() const override { return menus_; }
    QList<KeyHint> Keys() const override;
    bool MayClose() override;
    void GiveUpEdits() override;
    void TakeUpChanges() override;

Q_SIGNALS:
    void runRequested(const mirel::FormCall& call); // the form as it is now
    void formSaved();                               // the store has another form

protected:
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    struct Commands;

    void CreateActions();
    void CreateToolBar();
    void LayOut();
    void Connect();
    void ShowState();
    void ShowActions();
    void ShowStatus();
    void ShowFields();
    void FitPanels();
    void FitZoom();
    void SetZoom(qreal zoom);
    void StartPlacing(ControlType type);
    void AddField(const QString& name, QPoint at);
    void ChooseFields();
    QPoint NextPlace() const;
    void ShowProperties();
    void ChooseColor();
    void ChooseFont();
    void Copy();
    void Paste();
    void ImportForm();
    void ExportForm();
    void Run();
    void Save(bool saved);
    void ShowPopup(const QPoint& globalPosition);
    bool RunPartKey(const QKeyEvent& event);

    FormMakSurroundings surroundings_;
    FormMaker maker_;
    ExpressionDesk desk_;
    CommandActions* actions_ = nullptr;
    QList<QMenu*> menus_;
    QToolBar* toolBar_ = nullptr;
    QScrollArea* scroller_;
    DesignSurface* surface_;
    QWidget* fieldPanel_;
    QLabel* fieldTitle_;
    QListWidget* fieldList_;
    QScrollArea* sheetPanel_;
    PropertySheet* sheet_;
    ElidedLabel* status_;
    QStringList shownFields_;
    bool zoomByHand_ = false;
    bool givenUp_ = false; // the user does not want to keep it, and the view is about to close
    QBasicTimer forget_;   // that, when it does not close after all
};

} // namespace mirel
