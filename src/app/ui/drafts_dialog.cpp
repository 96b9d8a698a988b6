#include "app/ui/drafts_dialog.h"

#include "app/ui/entry_icon.h"
#include "platform/ui/entry_list.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QClipboard>
#include <QGridLayout>
#include <QGuiApplication>
#include <QLabel>
#include <QPlainTextEdit>
#include <QPushButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kFirstColumns = 44; // characters of the dialog's first width
constexpr int kFirstLines = 18;
constexpr int kMostListLines = 4;
constexpr int kFewListLines = 2; // on a small screen

QString ShownText(const TypedText& typed, const YesNoWords& words)
{
    return typed.isTick ? words.Of(typed.text == u"1") : typed.text;
}

QString TitleOf(const Draft& draft)
{
    const std::vector<TypedText>& texts = draft.typed.texts;
    if (texts.size() == 1)
        return StringText(Str::DraftEntry, {draft.view.name, texts.front().name});
    return StringText(Str::DraftFields, {draft.view.name, texts.front().name, QString::number(texts.size() - 1)});
}

QString WholeText(const Draft& draft, const YesNoWords& words)
{
    const std::vector<TypedText>& texts = draft.typed.texts;
    if (texts.size() == 1)
        return ShownText(texts.front(), words);
    QStringList lines;
    for (const TypedText& typed : texts)
        lines += StringText(Str::DraftTextLine, {typed.name, ShownText(typed, words)});
    return lines.join(u'\n');
}

QString StateText(const LeftDraft& left)
{
    switch (left.state) {
    case DraftState::Fits:
    case DraftState::Saved:
        return StringText(Str::DraftFits);
    case DraftState::Changed:
        return StringText(Str::DraftChanged);
    case DraftState::Gone:
        return StringText(Str::DraftGone);
    case DraftState::OtherDatabase:
        return StringText(Str::DraftOtherDatabase);
    case DraftState::NoView:
        break;
    }
    return StringText(Str::DraftNoView, {left.draft.view.name});
}

QLabel* WrappedLabel(QWidget* parent)
{
    auto* label = new QLabel(parent);
    label->setWordWrap(true);
    label->setTextFormat(Qt::PlainText);
    return label;
}

} // namespace

CDraftsDialog::CDraftsDialog(std::vector<LeftDraft> drafts, Actions actions, QWidget* parent)
    : QDialog(parent)
    , drafts_(std::move(drafts))
    , actions_(std::move(actions))
    , intro_(WrappedLabel(this))
    , list_(new EntryList(this))
    , title_(WrappedLabel(this))
    , text_(new QPlainTextEdit(this))
    , state_(WrappedLabel(this))
    , putBack_(Button(Str::DraftPutBack, Str::DraftPutBackTip))
    , copy_(Button(Str::DraftCopy, Str::DraftCopyTip))
    , discard_(Button(Str::DraftDiscard, Str::DraftDiscardTip))
    , later_(Button(Str::DraftLater, Str::DraftLaterTip))
{
    setWindowTitle(StringText(Str::DraftsTitle));
    intro_->setText(StringText(Str::DraftsIntro));
    list_->setAccessibleName(StringText(Str::DraftListName));
    QFont bold = title_->font();
    bold.setBold(true);
    title_->setFont(bold);
    text_->setReadOnly(true);
    text_->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    text_->setTabChangesFocus(true);
    text_->setAccessibleName(StringText(Str::DraftTextName));
    text_->setMinimumHeight(text_->fontMetrics().lineSpacing() * 2);
    state_->setForegroundRole(QPalette::PlaceholderText);
    copy_->setIcon(ThemeIcon(u"edit-copy"));
    LayOut(IsHandheldSize(parent->window()->size()));
    connect(list_, &EntryList::RowChanged, this, &CDraftsDialog::ShowSelected);
    connect(putBack_, &QPushButton::clicked, this, [this] { Do(actions_.putBack); });
    connect(discard_, &QPushButton::clicked, this, [this] { Do(actions_.discard); });
    connect(copy_, &QPushButton::clicked, this, [this] {
        QGuiApplication::clipboard()->setText(WholeText(drafts_[Selected()].draft, actions_.words));
    });
    connect(later_, &QPushButton::clicked, this, &QDialog::reject);
    ShowList();
    resize(QSize(fontMetrics().averageCharWidth() * kFirstColumns, fontMetrics().lineSpacing() * kFirstLines)
               .expandedTo(minimumSizeHint()));
    FillSmallWindow(*this, *parent->window());
    (putBack_->isEnabled() ? putBack_ : copy_)->setFocus();
}

QPushButton* CDraftsDialog::Button(Str text, Str tip)
{
    auto* button = new QPushButton(StringText(text), this);
    button->setToolTip(StringText(tip));
    return button;
}

void CDraftsDialog::LayOut(bool small)
{
    auto* buttons = new QGridLayout;
    const std::array<QPushButton*, 4> inOrder = {putBack_, copy_, discard_, later_};
    const int columns = small ? 2 : int(inOrder.size());
    for (int i = 0; i < int(inOrder.size()); ++i)
        buttons->addWidget(inOrder[size_t(i)], i / columns, i % columns);
    auto* column = new QVBoxLayout(this);
    column->addWidget(intro_);
    column->addWidget(list_);
    column->addWidget(title_);
    column->addWidget(text_, 1);
    column->addWidget(state_);
    column->addLayout(buttons);
}

void CDraftsDialog::ShowList()
{
    intro_->setVisible(drafts_.size() == 1 || !IsHandheldSize(parentWidget()->window()->size()));
    std::vector<EntryLine> lines;
    for (const LeftDraft& left : drafts_)
        lines.push_back({.name = TitleOf(left.draft),
                         .detail = {},
                         .toolTip = {},
                         .icon = IconOf(left.draft.view.kind),
                         .dimmed = left.state != DraftState::Fits});
    list_->SetLines(std::move(lines));
    list_->SetRow(0);
    list_->setVisible(drafts_.size() > 1);
    const int lineHeight = list_->HeightOfAll() / int(drafts_.size());
    const int most = IsHandheldSize(parentWidget()->window()->size()) ? kFewListLines : kMostListLines;
    list_->setFixedHeight(lineHeight * std::min(int(drafts_.size()), most) + 2 * list_->frameWidth());
    ShowSelected();
}

void CDraftsDialog::ShowSelected()
{
    const LeftDraft& left = drafts_[Selected()];
    title_->setText(TitleOf(left.draft));
    title_->setVisible(drafts_.size() == 1); // the list says it otherwise
    text_->setPlainText(WholeText(left.draft, actions_.words));
    state_->setText(StateText(left));
    putBack_->setEnabled(left.state == DraftState::Fits);
    (putBack_->isEnabled() ? putBack_ : copy_)->setDefault(true);
}

size_t CDraftsDialog::Selected() const
{
    return size_t(std::clamp(list_->Row(), 0, int(drafts_.size()) - 1));
}

void CDraftsDialog::Do(const std::function<QString(size_t)>& action)
{
    const size_t selected = Selected();
    const QString whyNot = action(selected);
    if (!whyNot.isEmpty()) {
        state_->setText(whyNot);
        return;
    }
    drafts_.erase(drafts_.begin() + qsizetype(selected));
    if (drafts_.empty())
        accept();
    else
        ShowList();
}

} // namespace mirel
