#include "forms/ui/form_mak_view.h"

#include "forms/control_types.h"
#include "forms/ui/design_surface.h"
#include "forms/ui/field_list.h"
#include "forms/ui/property_sheet.h"
#include "platform/ui/elided_label.h"
#include "platform/ui/file_choice.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QApplication>
#include <QClipboard>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QListWidget>
#include <QMimeData>
#include <QScrollArea>
#include <QScrollBar>
#include <QToolBar>
#include <QVBoxLayout>

#include <algorithm>
#include <cmath>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kControlsMime = u"application/x-mirel-controls"_s;

constexpr int kSheetFromWidth = 560; // the panels beside the surface
constexpr int kFieldsFromWidth = 760;
constexpr int kSheetWidth = 268;
constexpr int kFieldsWidth = 172;
constexpr int kAroundPx = 24;
constexpr qreal kMostFirstZoom = 1.75;
constexpr qreal kLeastFirstZoom = 0.85;
constexpr QSize kPreferred(900, 620);

} // namespace

CFormMakView::CFormMakView(FormDef form, FormMaker::Start start, FormMakSurroundings surroundings, QWidget* parent)
    : HostedView(parent)
    , surroundings_(std::move(surroundings))
    , maker_(std::move(form), start, surroundings_.maker)
    , desk_(surroundings_.maker.connection, surroundings_.maker.database, surroundings_.words)
    , scroller_(new QScrollArea(this))
    , surface_(new DesignSurface(maker_.Design(), nullptr))
    , fieldPanel_(new QWidget(this))
    , fieldTitle_(new QLabel(fieldPanel_))
    , fieldList_(new FieldList(fieldPanel_))
    , sheetPanel_(new QScrollArea(this))
    , sheet_(new PropertySheet(maker_, desk_, surroundings_.dialogs, nullptr))
    , status_(new ElidedLabel(this))
{
    maker_.losses = [this](const FormDef& design) { return desk_.LossesOf(design); };
    surface_->SetHoldTime(surroundings_.holdTimeMs);
    CreateActions();
    CreateToolBar();
    LayOut();
    Connect();
    ShowState();
}

CFormMakView::~CFormMakView() = default;

QSize CFormMakView::PreferredSize() const
{
    return kPreferred;
}

void CFormMakView::LayOut()
{
    auto* hint = new QLabel(StringText(Str::MakerFieldsHint), fieldPanel_);
    hint->setWordWrap(true);
    for (QLabel* label : {hint, fieldTitle_}) {
        QPalette dim = label->palette();
        dim.setColor(QPalette::WindowText, ColorOfRole(LookRole::Dim, dim));
        label->setPalette(dim);
        label->setMinimumWidth(1);
    }
    auto* fields = new QVBoxLayout(fieldPanel_);
    fields->setContentsMargins(spacing::kGap, spacing::kGap, 0, spacing::kGap);
    fields->addWidget(fieldTitle_);
    fields->addWidget(fieldList_, 1);
    fields->addWidget(hint);
    fieldPanel_->setFixedWidth(kFieldsWidth);
    fieldList_->setFrameShape(QFrame::NoFrame);
    fieldList_->setAccessibleName(StringText(Str::DeskFields));

    scroller_->setWidget(surface_);
    scroller_->setFrameShape(QFrame::NoFrame);
    scroller_->setAlignment(Qt::AlignHCenter | Qt::AlignTop);
    scroller_->setFocusPolicy(Qt::NoFocus);
    scroller_->viewport()->installEventFilter(this);
    surface_->installEventFilter(this);
    sheetPanel_->setWidget(sheet_);
    sheetPanel_->setWidgetResizable(true);
    sheetPanel_->setFrameShape(QFrame::NoFrame);
    sheetPanel_->setFixedWidth(kSheetWidth);
    sheetPanel_->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    sheetPanel_->setFocusPolicy(Qt::NoFocus);
    sheetPanel_->viewport()->setAutoFillBackground(false);
    sheet_->setAutoFillBackground(false);

    fieldPanel_->hide(); // until there is room for them
    sheetPanel_->hide();

    auto* middle = new QHBoxLayout;
    middle->setSpacing(0);
    middle->addWidget(fieldPanel_);
    middle->addWidget(scroller_, 1);
    middle->addWidget(sheetPanel_);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins({});
    column->setSpacing(0);
    column->addWidget(toolBar_);
    column->addLayout(middle, 1);
    auto* line = new QHBoxLayout;
    line->setContentsMargins(spacing::kGap, spacing::kTight, spacing::kGap, spacing::kTight);
    line->addWidget(status_);
    column->addLayout(line);
    setFocusProxy(surface_);
    setContextMenuPolicy(Qt::NoContextMenu);
}

void CFormMakView::Connect()
{
    connect(surface_, &DesignSurface::acted, this, &CFormMakView::ShowState);
    connect(surface_, &DesignSurface::placed, this, [this] {
        ShowState();
        if (IsHandheldSize(window()->size()))
            return;
        sheet_->ShowState();
    });
    connect(surface_, &DesignSurface::propertiesRequested, this, &CFormMakView::ShowProperties);
    connect(surface_, &DesignSurface::popupRequested, this, &CFormMakView::ShowPopup);
    connect(surface_, &DesignSurface::fieldDropped, this, &CFormMakView::AddField);
    connect(sheet_, &PropertySheet::acted, this, &CFormMakView::ShowState);
    connect(fieldList_, &QListWidget::itemActivated, this,
            [this](const QListWidgetItem* item) { AddField(item->data(Qt::UserRole).toString(), NextPlace()); });
}

bool CFormMakView::MayClose()
{
    if (givenUp_)
        return true;
    const bool wasModified = maker_.Design().IsModified();
    const bool may = maker_.MayClose();
    if (may && maker_.Design().IsModified())
        GiveUpEdits();
    else if (wasModified && may)
        Q_EMIT formSaved();
    ShowState();
    return may;
}

// Closing follows at once, or after the questions of other views.
void CFormMakView::GiveUpEdits()
{
    givenUp_ = true;
    forget_.start(0, this);
}

void CFormMakView::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != forget_.timerId())
        return HostedView::timerEvent(event);
    if (QApplication::activeModalWidget())
        return;
    forget_.stop();
    givenUp_ = false;
}

void CFormMakView::TakeUpChanges()
{
    desk_.Close();
    maker_.ForgetFields();
    shownFields_.clear();
    ShowFields();
}

// --- showing ------------------------------------------------------------------------------------------------

void CFormMakView::ShowState()
{
    const FormDesign& design = maker_.Design();
    surface_->ShowState();
    const QString name = design.Form().name.Text();
    setWindowTitle(StringText(Str::MakerDesignTitle, {name.isEmpty() ? StringText(Str::MakerNewTitle) : name}) +
                   u"[*]"_s);
    setWindowModified(design.IsModified());
    if (!design.IsDragging()) {
        ShowFields();
        ShowActions();
    }
    if (sheetPanel_->isVisibleTo(this))
        sheet_->ShowState();
    ShowStatus();
}

void CFormMakView::ShowStatus()
{
    const FormDesign& design = maker_.Design();
    const int only = design.TheSelected();
    QString text;
    if (const std::optional<ControlType> placing = surface_->Placing()) {
        text = StringText(Str::MakerPlaceHint, {StringText(TypeOf(*placing).title)});
    } else if (only >= 0) {
        const ControlDef& control = design.Control(only);
        text = StringText(Str::MakerStatusControl,
                          {control.name.Text(),
                           StringText(TypeOf(control.type).title, {QString::number(int(control.type))}),
                           QString::number(control.left), QString::number(control.top),
                           QString::number(control.width), QString::number(control.height)});
    } else if (design.Selection().size() > 1) {
        text = StringText(Str::MakerStatusSeveral, {QString::number(design.Selection().size())});
    } else {
        text = StringText(Str::MakerStatusForm,
                          {design.Form().tableName.Text(), QString::number(design.Form().width),
                           QString::number(design.Form().height), QString::number(design.Count())});
    }
    const QString zoom = StringText(Str::MakerZoomText, {QString::number(qRound(surface_->Zoom() * 100))});
    status_->SetText(text + u"   "_s + zoom);
}

void CFormMakView::ShowFields()
{
    QStringList names{maker_.Design().Form().tableName.Text()};
    for (const ResultField& field : maker_.Fields())
        names += field.name;
    if (names == shownFields_)
        return;
    shownFields_ = names;
    fieldTitle_->setText(StringText(Str::MakerFieldsOf, {names.first()}));
    fieldTitle_->setToolTip(names.first().toHtmlEscaped());
    FillFieldList(*fieldList_, maker_.Fields());
}

void CFormMakView::FitPanels()
{
    sheetPanel_->setVisible(width() >= kSheetFromWidth);
    fieldPanel_->setVisible(width() >= kFieldsFromWidth);
    const bool wide = width() >= kFieldsFromWidth;
    toolBar_->setToolButtonStyle(wide ? Qt::ToolButtonTextUnderIcon : Qt::ToolButtonIconOnly);
    status_->setVisible(height() >= 260);
}

void CFormMakView::resizeEvent(QResizeEvent* event)
{
    HostedView::resizeEvent(event);
    FitPanels();
    ShowState();
}

void CFormMakView::showEvent(QShowEvent* event)
{
    HostedView::showEvent(event);
    FitPanels();
    FitZoom();
}

bool CFormMakView::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == scroller_->viewport() && event->type() == QEvent::Resize)
        FitZoom();
    if (watched == surface_ && event->type() == QEvent::KeyPress && RunPartKey(*static_cast<QKeyEvent*>(event)))
        return true;
    return HostedView::eventFilter(watched, event);
}

// Until the user chooses, the form takes the room that there is.
void CFormMakView::FitZoom()
{
    if (zoomByHand_)
        return;
    const int room = scroller_->viewport()->width() - (width() >= kSheetFromWidth ? kAroundPx : 0);
    const qreal exact = qreal(room) / std::max(maker_.Design().Form().width, 1);
    qreal zoom = std::clamp(std::floor(4 * exact) / 4, 1.0, kMostFirstZoom);
    if (exact < 1 && exact >= kLeastFirstZoom) // what little it is too wide is squeezed
        zoom = exact;
    if (zoom != surface_->Zoom())
        surface_->SetZoom(zoom);
    ShowStatus();
}

void CFormMakView::SetZoom(qreal zoom)
{
    constexpr qreal kLeast = 0.5;
    constexpr qreal kMost = 4;
    zoomByHand_ = true;
    surface_->SetZoom(std::clamp(zoom, kLeast, kMost));
    ShowStatus();
}

// --- controls and fields ------------------------------------------------------------------------------------

void CFormMakView::StartPlacing(ControlType type)
{
    const bool again = surface_->Placing() == type;
    surface_->SetPlacing(again ? std::nullopt : std::optional(type));
    surface_->setFocus();
    ShowState();
}

void CFormMakView::AddField(const QString& name, QPoint at)
{
    const std::vector<ResultField>& fields = maker_.Fields();
    const auto field = std::ranges::find(fields, name, &ResultField::name);
    if (field == fields.end())
        return;
    maker_.Design().AddField(*field, at);
    ShowState();
    scroller_->ensureVisible(surface_->RectOf(maker_.Design().TheSelected()).center().x(),
                             surface_->RectOf(maker_.Design().TheSelected()).bottom());
}

// Below what is there.
QPoint CFormMakView::NextPlace() const
{
    constexpr int kMargin = 4;
    qint64 bottom = 0;
    for (const ControlDef& control : maker_.Design().Form().controls)
        bottom = std::max(bottom, Edges::Of(control).bottom);
    return {kMargin, int(std::min<qint64>(bottom, 8000)) + kMargin};
}

void CFormMakView::ChooseFields()
{
    CFieldsDialog dialog(maker_.Fields(), this);
    connect(&dialog, &CFieldsDialog::fieldChosen, this,
            [this](const QString& name) { AddField(name, NextPlace()); });
    dialog.exec();
}

void CFormMakView::ShowProperties()
{
    if (sheetPanel_->isVisible()) {
        sheet_->ShowState();
        sheet_->FocusFirst();
        return;
    }
    CPropertySheet sheet(maker_, desk_, surroundings_.dialogs, this);
    connect(&sheet, &CPropertySheet::acted, this, &CFormMakView::ShowState);
    sheet.exec();
    ShowState();
}

void CFormMakView::ChooseColor()
{
    FormDesign& design = maker_.Design();
    const bool isForm = design.Selection().empty();
    quint32 color =
        isForm ? design.Form().backgroundColor : design.Control(design.Selection().front()).backgroundColor;
    if (!surroundings_.dialogs.chooseColor || !surroundings_.dialogs.chooseColor(color, *this))
        return;
    if (isForm)
        design.Change([color](FormDef& form) { form.backgroundColor = color; });
    else
        design.ChangeSelected([color](ControlDef& control) { control.backgroundColor = color; });
    ShowState();
}

void CFormMakView::ChooseFont()
{
    FormDesign& design = maker_.Design();
    const bool isForm = design.Selection().empty();
    TextStyle style = isForm ? design.Form().textStyle : design.Control(design.Selection().front()).textStyle;
    if (!surroundings_.dialogs.chooseFont || !surroundings_.dialogs.chooseFont(style, *this))
        return;
    if (isForm)
        design.Change([&style](FormDef& form) { form.textStyle = style; });
    else
        design.ChangeSelected([&style](ControlDef& control) { control.textStyle = style; });
    ShowState();
}

void CFormMakView::Copy()
{
    auto* copied = new QMimeData;
    copied->setData(kControlsMime, maker_.Design().CopySelected());
    QGuiApplication::clipboard()->setMimeData(copied);
    ShowActions();
}

void CFormMakView::Paste()
{
    const QMimeData* copied = QGuiApplication::clipboard()->mimeData();
    if (copied && copied->hasFormat(kControlsMime))
        (void)maker_.Design().Paste(copied->data(kControlsMime));
    ShowState();
}

// --- files, saving, running ---------------------------------------------------------------------------------

namespace {

FileRequest FormFile(Str title, FileUse use, const QString& near, const QString& name)
{
    return {.title = title,
            .accept = title,
            .use = use,
            .kind = {.filter = Str::MakerFilter, .endings = {u".pfs"_s}, .icon = u"mirel-form"},
            .near = near,
            .name = name};
}

} // namespace

void CFormMakView::ImportForm()
{
    if (!maker_.MayImport())
        return;
    const QString path =
        ChooseFile(*this, FormFile(Str::MakerImport, FileUse::Open, surroundings_.maker.database.FilePath(), {}));
    if (path.isEmpty())
        return;
    surface_->hide(); // while it is built again
    (void)maker_.Import(path);
    surface_->show();
    ShowState();
}

void CFormMakView::ExportForm()
{
    const QString name = maker_.Design().Form().name.Text() + u".pfs"_s;
    const QString path = ChooseFile(
        *this, FormFile(Str::MakerExport, FileUse::Create, surroundings_.maker.database.FilePath(), name));
    if (!path.isEmpty())
        (void)maker_.Export(path);
}

void CFormMakView::Run()
{
    FormCall call;
    call.form.CopyFrom(maker_.Design().Form());
    Q_EMIT runRequested(call);
}

void CFormMakView::Save(bool saved)
{
    if (saved)
        Q_EMIT formSaved();
    ShowState();
}

} // namespace mirel
