#include "forms/ui/property_editors.h"

#include "data/catalog.h"
#include "forms/control_types.h"
#include "forms/design/new_controls.h"
#include "forms/ui/control_look.h"
#include "forms/ui/expression_field.h"
#include "forms/ui/pair_editor.h"
#include "platform/ui/look_roles.h"
#include "resources/string_table.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QPainter>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QSignalBlocker>
#include <QSpinBox>
#include <QVBoxLayout>

#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kSwatchPx = 12;
constexpr int kLinesShown = 3;
constexpr int kFewCharacters = 6;

void Fill(QWidget& editor, QWidget* inner)
{
    auto* column = new QVBoxLayout(&editor);
    column->setContentsMargins({});
    column->addWidget(inner);
    editor.setFocusProxy(inner);
}

QComboBox* NarrowBox(QWidget* parent)
{
    auto* box = new QComboBox(parent);
    box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    box->setMinimumContentsLength(kFewCharacters);
    box->setFocusPolicy(Qt::StrongFocus);
    return box;
}

class TextEditor : public PropertyEditor {
public:
    TextEditor(const PropertyDef& def, QWidget* parent)
        : PropertyEditor(parent)
        , line_(new QLineEdit(this))
    {
        if (def.maxLength > 0)
            line_->setMaxLength(def.maxLength);
        line_->setAccessibleName(StringText(def.caption));
        Fill(*this, line_);
        connect(line_, &QLineEdit::textEdited, this, &PropertyEditor::changed);
    }
    void Show(const QString& value) override
    {
        if (line_->text() != value)
            line_->setText(value);
    }

private:
    QLineEdit* line_;
};

class NumberEditor : public PropertyEditor {
public:
    NumberEditor(const PropertyDef& def, QWidget* parent)
        : PropertyEditor(parent)
        , box_(new QSpinBox(this))
    {
        box_->setRange(def.least, def.most);
        box_->setAccessibleName(StringText(def.caption));
        box_->setFocusPolicy(Qt::StrongFocus);
        box_->setMinimumWidth(1);
        box_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
        Fill(*this, box_);
        connect(box_, &QSpinBox::valueChanged, this,
                [this](int number) { Q_EMIT changed(QString::number(number)); });
    }
    // What a file holds beyond the range stays until another number is typed.
    void Show(const QString& value) override
    {
        const QSignalBlocker quiet(box_);
        if (box_->value() != value.toInt())
            box_->setValue(value.toInt());
    }

private:
    QSpinBox* box_;
};

class FlagEditor : public PropertyEditor {
public:
    FlagEditor(const PropertyDef& def, QWidget* parent)
        : PropertyEditor(parent)
        , box_(new QCheckBox(StringText(def.caption), this))
    {
        Fill(*this, box_);
        connect(box_, &QCheckBox::clicked, this, [this](bool on) { Q_EMIT changed(on ? u"1"_s : u"0"_s); });
    }
    void Show(const QString& value) override { box_->setChecked(value == u"1"); }
    bool HasOwnCaption() const override { return true; }

private:
    QCheckBox* box_;
};

class ChoiceEditor : public PropertyEditor {
public:
    ChoiceEditor(const PropertyDef& def, QWidget* parent)
        : PropertyEditor(parent)
        , def_(def)
        , box_(NarrowBox(this))
    {
        for (const PropertyChoice& choice : def.choices) {
            if (choice.offered)
                box_->addItem(StringText(choice.text), choice.value);
        }
        box_->setAccessibleName(StringText(def.caption));
        Fill(*this, box_);
        connect(box_, &QComboBox::activated, this,
                [this] { Q_EMIT changed(QString::number(box_->currentData().toInt())); });
    }
    // A number that is not offered has an entry of its own, as long as it is there.
    void Show(const QString& value) override
    {
        const int number = value.toInt();
        int index = box_->findData(number);
        if (index < 0) {
            box_->addItem(ChoiceText(def_, number), number);
            index = box_->count() - 1;
        }
        box_->setCurrentIndex(index);
    }

private:
    PropertyDef def_;
    QComboBox* box_;
};

class ColorEditor : public PropertyEditor {
public:
    ColorEditor(const PropertyDef& def, const SheetContext& context, QWidget* parent)
        : PropertyEditor(parent)
        , button_(new QPushButton(this))
    {
        button_->setAccessibleName(StringText(def.caption));
        Fill(*this, button_);
        connect(button_, &QPushButton::clicked, this, [this, &dialogs = context.dialogs] {
            quint32 color = color_;
            if (dialogs.chooseColor && dialogs.chooseColor(color, *this))
                Q_EMIT changed(QString::number(color));
        });
    }
    void Show(const QString& value) override
    {
        color_ = quint32(value.toLongLong());
        const std::optional<QColor> color = ColorOf(color_);
        button_->setText(color ? color->name() : StringText(Str::MakerColorDesktop));
        if (!color) {
            button_->setIcon({});
            return;
        }
        QPixmap swatch(kSwatchPx, kSwatchPx);
        swatch.fill(*color);
        QPainter painter(&swatch);
        painter.setPen(ColorOfRole(LookRole::Edge, palette()));
        painter.drawRect(0, 0, kSwatchPx - 1, kSwatchPx - 1);
        button_->setIcon(swatch);
    }

private:
    QPushButton* button_;
    quint32 color_ = kDefaultColor;
};

class FontEditor : public PropertyEditor {
public:
    FontEditor(const PropertyDef& def, const SheetContext& context, QWidget* parent)
        : PropertyEditor(parent)
        , context_(context)
        , button_(new QPushButton(this))
    {
        button_->setAccessibleName(StringText(def.caption));
        button_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
        Fill(*this, button_);
        connect(button_, &QPushButton::clicked, this, &FontEditor::Choose);
    }
    void Show(const QString& value) override
    {
        text_ = value;
        ShowText();
    }

protected:
    void resizeEvent(QResizeEvent* event) override
    {
        PropertyEditor::resizeEvent(event);
        ShowText();
    }

private:
    void ShowText()
    {
        button_->setText(fontMetrics().elidedText(text_, Qt::ElideRight, std::max(width() - 16, 30)));
        button_->setToolTip(text_.toHtmlEscaped());
    }
    void Choose()
    {
        FormDesign& design = context_.maker.Design();
        const bool isForm = context_.control < 0;
        TextStyle style = isForm ? design.Form().textStyle : design.Control(context_.control).textStyle;
        if (!context_.dialogs.chooseFont || !context_.dialogs.chooseFont(style, *this))
            return;
        if (isForm)
            design.Change([&style](FormDef& form) { form.textStyle = style; });
        else
            design.ChangeControl(context_.control, [&style](ControlDef& control) { control.textStyle = style; });
        Q_EMIT changed(StyleInWords(style));
    }

    SheetContext context_;
    QPushButton* button_;
    QString text_;
};

// A text of several lines: a statement, or the items of a drop-down box.
class LinesEditor : public PropertyEditor {
public:
    LinesEditor(const PropertyDef& def, const SheetContext& context, QWidget* parent)
        : PropertyEditor(parent)
        , context_(context)
        , followsSelect_(def.followsSelect)
        , text_(new QPlainTextEdit(this))
    {
        text_->setAccessibleName(StringText(def.caption));
        text_->setTabChangesFocus(true);
        text_->setFixedHeight(kLinesShown * fontMetrics().lineSpacing() + 10);
        auto* column = new QVBoxLayout(this);
        column->setContentsMargins({});
        column->setSpacing(spacing::kTight);
        column->addWidget(text_);
        setFocusProxy(text_);
        if (def.kind == PropertyKind::Query) {
            auto* builder = new QPushButton(StringText(Str::PropBuilder), this);
            builder->setEnabled(bool(context.dialogs.buildQuery));
            builder->setToolTip(builder->isEnabled() ? QString() : StringText(Str::PropBuilderTip));
            connect(builder, &QPushButton::clicked, this, &LinesEditor::Build);
            column->addWidget(builder, 0, Qt::AlignLeft);
        }
        connect(text_, &QPlainTextEdit::textChanged, this, [this] {
            if (!showing_)
                Q_EMIT changed(text_->toPlainText());
        });
    }
    void Show(const QString& value) override
    {
        // The editor makes one kind of line end of all; what was not typed in stays as it is.
        if (text_->toPlainText() == QString(value).replace(u"\r\n"_s, u"\n"_s).replace(u'\r', u'\n'))
            return;
        showing_ = true;
        text_->setPlainText(value);
        showing_ = false;
    }
    bool IsWide() const override { return true; }

private:
    void Build()
    {
        MakerDialogs::Query query{text_->toPlainText(), context_.maker.Design().Form().tableName.Text(),
                                  followsSelect_};
        if (context_.dialogs.buildQuery(query, *this))
            text_->setPlainText(query.text);
    }

    SheetContext context_;
    bool followsSelect_;
    QPlainTextEdit* text_;
    bool showing_ = false;
};

// A name to be chosen: a field, a table, a form.
class NameEditor : public PropertyEditor {
public:
    NameEditor(const PropertyDef& def, const SheetContext& context, QWidget* parent)
        : PropertyEditor(parent)
        , box_(NarrowBox(this))
    {
        box_->setAccessibleName(StringText(def.caption));
        Fill(*this, box_);
        switch (def.kind) {
        case PropertyKind::Field:
            FillFields(context);
            break;
        case PropertyKind::Table:
            box_->addItem(StringText(Str::PropNoTable), QString());
            for (const QString& table : context.maker.Tables())
                box_->addItem(table, table);
            break;
        default:
            for (const FormDef& form : context.maker.Surroundings().store.Forms())
                box_->addItem(form.name.Text(), form.name.Text());
            break;
        }
        connect(box_, &QComboBox::activated, this, [this] { Q_EMIT changed(box_->currentData().toString()); });
    }
    // What is not in the list, because it is gone or written in another way, has an entry of its own.
    void Show(const QString& value) override
    {
        int index = box_->findData(value);
        if (index < 0) {
            box_->addItem(value, value);
            index = box_->count() - 1;
        }
        box_->setCurrentIndex(index);
    }

private:
    void FillFields(const SheetContext& context)
    {
        box_->addItem(StringText(Str::PropNoField), QString());
        if (context.control < 0)
            return;
        const FormDesign& design = context.maker.Design();
        const bool ticks = Has(design.Control(context.control).type, IsTicked);
        for (const ResultField& field : context.maker.Fields()) {
            const QString source = FieldSource(design.Form().tableName.Text(), field.name);
            box_->addItem(field.name, ticks ? u"WHERE %1=1"_s.arg(source) : source);
        }
    }

    QComboBox* box_;
};

} // namespace

PropertyEditor* MakePropertyEditor(const PropertyDef& def, const SheetContext& context, QWidget* parent)
{
    switch (def.kind) {
    case PropertyKind::Text:
        return new TextEditor(def, parent);
    case PropertyKind::Number:
        return new NumberEditor(def, parent);
    case PropertyKind::Flag:
        return new FlagEditor(def, parent);
    case PropertyKind::Choice:
        return new ChoiceEditor(def, parent);
    case PropertyKind::Color:
        return new ColorEditor(def, context, parent);
    case PropertyKind::Font:
        return new FontEditor(def, context, parent);
    case PropertyKind::Expression:
        return new ExpressionField(def, context, parent);
    case PropertyKind::Query:
    case PropertyKind::Items:
        return new LinesEditor(def, context, parent);
    case PropertyKind::Columns:
    case PropertyKind::Assignments:
        return new PairEditor(def, context, parent);
    case PropertyKind::Field:
    case PropertyKind::Table:
    case PropertyKind::CalledForm:
        break;
    }
    return new NameEditor(def, context, parent);
}

} // namespace mirel
