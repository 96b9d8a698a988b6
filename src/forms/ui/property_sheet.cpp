#include "forms/ui/property_sheet.h"

#include "forms/control_types.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QApplication>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QLabel>
#include <QVBoxLayout>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kCaptionWidth = 84;

QString TargetName(const ControlDef& control)
{
    const QString type = StringText(TypeOf(control.type).title, {QString::number(int(control.type))});
    const QString name = control.name.Text();
    return name.isEmpty() ? type : u"%1 (%2)"_s.arg(name, type);
}

} // namespace

PropertySheet::PropertySheet(FormMaker& maker, ExpressionDesk& desk, const MakerDialogs& dialogs, QWidget* parent)
    : QWidget(parent)
    , context_{maker, desk, dialogs, -1}
    , target_(new QComboBox(this))
    , column_(new QVBoxLayout(this))
{
    target_->setAccessibleName(StringText(Str::MakerSelectedName));
    target_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    target_->setMinimumContentsLength(8);
    column_->setContentsMargins(spacing::kGap, spacing::kGap, spacing::kGap, spacing::kGap);
    column_->addWidget(target_);
    connect(target_, &QComboBox::activated, this, [this](int index) {
        FormDesign& design = context_.maker.Design();
        if (index == 0)
            design.SelectNone();
        else
            design.SelectOnly(index - 1);
        Q_EMIT acted();
    });
    ShowState();
}

std::vector<PropertySheet::Line> PropertySheet::LinesFor(int control) const
{
    std::vector<Line> lines;
    const FormDesign& design = context_.maker.Design();
    if (control < 0) {
        for (const FormProperty& row : FormProperties()) {
            if (IsShown(row, design.Form()))
                lines.push_back({nullptr, &row, nullptr});
        }
        return lines;
    }
    for (const ControlProperty& row : ControlProperties()) {
        if (IsShown(row, design.Control(control)))
            lines.push_back({&row, nullptr, nullptr});
    }
    return lines;
}

void PropertySheet::ShowTargets()
{
    const FormDesign& design = context_.maker.Design();
    QStringList targets{StringText(Str::PropFormItself)};
    for (const ControlDef& control : design.Form().controls)
        targets += TargetName(control);
    if (targets != targets_) {
        targets_ = targets;
        target_->clear();
        target_->addItems(targets);
    }
    target_->setCurrentIndex(design.TheSelected() + 1);
}

void PropertySheet::ShowState()
{
    const FormDesign& design = context_.maker.Design();
    if (!design.IsDragging())
        ShowTargets();
    const int control = design.TheSelected();
    const QString table = design.Form().tableName.Text();
    std::vector<Line> lines = LinesFor(control);
    const bool same = built_ && control == context_.control && table == table_ &&
                      std::ranges::equal(lines, lines_, [](const Line& a, const Line& b) {
                          return a.control == b.control && a.form == b.form;
                      });
    if (!same && !writing_) {
        table_ = table;
        shownLines_ = std::exchange(lines_, std::move(lines));
        Build(control);
        shownLines_.clear();
    }
    if (!same && writing_)
        return; // it is built when the line that was written is done with it
    for (const Line& line : lines_)
        line.editor->Show(line.control ? line.control->read(design.Control(control))
                                       : line.form->read(design.Form()));
}

void PropertySheet::Build(int control)
{
    // A line that stays keeps the focus: the arrow keys in one change what lines there are.
    const PropertyDef* focused = nullptr;
    if (built_ && control == context_.control)
        focused = FocusedLine();
    built_ = true;
    context_.control = control;
    delete page_;
    page_ = new QWidget(this);
    auto* column = new QVBoxLayout(page_);
    column->setContentsMargins({});
    column->setSpacing(spacing::kTight);
    std::optional<PropertyGroup> group;
    for (size_t i = 0; i < lines_.size(); ++i) {
        const PropertyDef& def = lines_[i].control ? lines_[i].control->def : lines_[i].form->def;
        if (group != def.group) {
            auto* title = new QLabel(StringText(GroupTitle(def.group)), page_);
            QPalette dim = title->palette();
            dim.setColor(QPalette::WindowText, ColorOfRole(LookRole::Dim, dim));
            title->setPalette(dim);
            title->setContentsMargins(0, group ? spacing::kGap : 0, 0, 0);
            column->addWidget(title);
            group = def.group;
        }
        AddLine(*column, lines_[i], int(i));
    }
    column->addStretch(1);
    column_->addWidget(page_, 1);
    page_->show(); // or it could not take the focus
    for (const Line& line : lines_) {
        if (focused == (line.control ? &line.control->def : &line.form->def))
            line.editor->setFocus();
    }
}

const PropertyDef* PropertySheet::FocusedLine() const
{
    const QWidget* focus = QApplication::focusWidget();
    for (const Line& line : shownLines_) {
        if (focus && line.editor->isAncestorOf(focus))
            return line.control ? &line.control->def : &line.form->def;
    }
    return nullptr;
}

void PropertySheet::AddLine(QVBoxLayout& column, Line& line, int number)
{
    const PropertyDef& def = line.control ? line.control->def : line.form->def;
    line.editor = MakePropertyEditor(def, context_, page_);
    const Line written = line;
    connect(line.editor, &PropertyEditor::changed, this,
            [this, written, number](const QString& value) { Write(written, number, value); });
    if (line.editor->HasOwnCaption()) {
        column.addWidget(line.editor);
        return;
    }
    auto* caption = new QLabel(StringText(def.caption), page_);
    caption->setBuddy(line.editor);
    if (line.editor->IsWide()) {
        column.addWidget(caption);
        column.addWidget(line.editor);
        return;
    }
    caption->setFixedWidth(std::max(kCaptionWidth, caption->sizeHint().width()));
    auto* row = new QHBoxLayout;
    row->setSpacing(spacing::kTight);
    row->addWidget(caption);
    row->addWidget(line.editor, 1);
    column.addLayout(row);
}

void PropertySheet::Write(const Line& line, int number, const QString& value)
{
    FormDesign& design = context_.maker.Design();
    const int control = context_.control;
    if (control >= design.Count())
        return;
    const QString key = u"property %1 of %2"_s.arg(QString::number(number), QString::number(control));
    writing_ = true;
    if (line.control)
        design.ChangeControl(
            control, [&](ControlDef& def) { line.control->write(def, value); }, key);
    else
        design.Change([&](FormDef& def) { line.form->write(def, value); }, key);
    writing_ = false;
    Q_EMIT acted();
    // The line that told is in the middle of its call, and may be one of those that go.
    QMetaObject::invokeMethod(this, &PropertySheet::ShowState, Qt::QueuedConnection);
}

void PropertySheet::FocusFirst()
{
    if (!lines_.empty())
        lines_.front().editor->setFocus();
}

// --- on a small window --------------------------------------------------------------------------------------

CPropertySheet::CPropertySheet(FormMaker& maker, ExpressionDesk& desk, const MakerDialogs& dialogs,
                               QWidget* parent)
    : QDialog(parent)
{
    setWindowTitle(StringText(Str::MakerSheetTitle));
    auto* sheet = new PropertySheet(maker, desk, dialogs, this);
    connect(sheet, &PropertySheet::acted, this, &CPropertySheet::acted);
    connect(
        sheet, &PropertySheet::acted, sheet, [sheet] { sheet->ShowState(); }, Qt::QueuedConnection);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, this);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::accept);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(spacing::kTight, spacing::kTight, spacing::kTight, spacing::kTight);
    column->addWidget(Scrolled(sheet), 1);
    column->addWidget(buttons);
    const int line = fontMetrics().lineSpacing();
    resize(line * 24, line * 32);
    FillSmallWindow(*this, *parent->window());
    sheet->FocusFirst();
}

} // namespace mirel
