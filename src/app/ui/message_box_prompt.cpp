#include "app/ui/message_box_prompt.h"

#include "platform/ui/look_roles.h"
#include "platform/ui/wait_cursor.h"
#include "platform/ui/window_place.h"
#include "platform/ui/wrapped_text.h"
#include "resources/string_table.h"

#include <QApplication>
#include <QDialogButtonBox>
#include <QElapsedTimer>
#include <QGridLayout>
#include <QInputDialog>
#include <QLabel>
#include <QLocale>
#include <QMessageBox>
#include <QProgressDialog>
#include <QPushButton>
#include <QStyle>

#include <algorithm>
#include <utility>
#include <vector>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kMomentMs = 400; // work that ends within it shows no box
constexpr int kRepaintMs = 50;
constexpr int kSteps = 1000; // of the bar: totals may pass what a bar counts to

QWidget* FrontWindow()
{
    if (QWidget* modal = QApplication::activeModalWidget())
        return modal;
    if (QWidget* active = QApplication::activeWindow())
        return active;
    const QWidgetList windows = QApplication::topLevelWidgets();
    const auto shown = std::ranges::find_if(windows, [](const QWidget* window) {
        return window->isVisible() && (window->windowFlags() & Qt::WindowType_Mask) == Qt::Window;
    });
    return shown == windows.end() ? nullptr : *shown;
}

// The system's texts break lines as the handheld did.
QString LinesOf(QString text)
{
    return text.replace(u"\r\n"_s, u"\n"_s);
}

// What of a text does not fit a box can be read in its details.
constexpr int kMostLines = 12;
constexpr int kFewestLines = 3;
constexpr int kWidestChars = 60;

int RoomFor(const QWidget* window, const QFontMetrics& metrics)
{
    constexpr int kAroundPx = 2 * spacing::kSection + 2 * spacing::kGap; // the box's frame and margins
    const int widest = kWidestChars * metrics.averageCharWidth();
    return window ? std::clamp(window->width() - kAroundPx, widest / 4, widest) : widest;
}

int LinesFor(const QWidget* window, const QFontMetrics& metrics)
{
    constexpr int kOtherLines = 8; // the note, the buttons, margins
    const int fitting = window ? window->height() / metrics.lineSpacing() - kOtherLines : kMostLines;
    return std::clamp(fitting, kFewestLines, kMostLines);
}

// Texts as wide as the window allows, with a plain line below; a handheld has no room for the picture beside them.
class WideBox : public QMessageBox {
public:
    WideBox(Icon icon, const QString& text, const QString& note, StandardButtons buttons)
        : QMessageBox(icon, QApplication::applicationDisplayName(), {}, buttons, FrontWindow())
    {
        const bool small = parentWidget() && IsHandheldSize(parentWidget()->window()->size());
        if (small)
            setIcon(NoIcon);
        setTextFormat(Qt::PlainText);
        const int picture = small ? 0 : style()->pixelMetric(QStyle::PM_MessageBoxIconSize) + spacing::kSection;
        const int room = RoomFor(parentWidget() ? parentWidget()->window() : nullptr, fontMetrics()) - picture;
        QStringList lines = WrappedText(LinesOf(text), font(), room).split(u'\n');
        const int most = LinesFor(parentWidget() ? parentWidget()->window() : nullptr, fontMetrics());
        if (lines.size() > most) {
            setDetailedText(text);
            lines.resize(most);
            lines.last() = lines.last().chopped(1) + u'…';
        }
        setText(lines.join(u'\n'));
        if (!note.isEmpty())
            setInformativeText(WrappedText(LinesOf(note), font(), room));
        if (auto* grid = qobject_cast<QGridLayout*>(layout()))
            grid->addItem(new QSpacerItem(room + picture, 0), grid->rowCount(), 0, 1, grid->columnCount());
    }

    // Buttons that do not stand side by side stand one above the other.
    void FitButtons()
    {
        constexpr int kAroundPx = 2 * spacing::kSection;
        auto* buttons = findChild<QDialogButtonBox*>();
        if (!buttons || !parentWidget() ||
            buttons->sizeHint().width() + kAroundPx <= parentWidget()->window()->width())
            return;
        buttons->setOrientation(Qt::Vertical);
        for (QAbstractButton* button : buttons->buttons())
            button->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    }
};

// The boxes of the work in progress, the latest last.
std::vector<QProgressDialog*>& WorkShown()
{
    static std::vector<QProgressDialog*> boxes;
    return boxes;
}

// Nothing covers a question or an error: the work's box makes room for it, and comes back with its next step.
class WorkHidden {
public:
    WorkHidden()
    {
        for (QProgressDialog* box : WorkShown())
            box->hide();
    }
    ~WorkHidden() = default;
    Q_DISABLE_COPY_MOVE(WorkHidden)
};

QMessageBox::StandardButton Ask(const QString& text, const QString& note, QMessageBox::Icon icon,
                                QMessageBox::StandardButtons buttons, QMessageBox::StandardButton preset)
{
    const WorkHidden hidden;
    WideBox box(icon, text, note, buttons);
    box.setDefaultButton(preset);
    box.setEscapeButton(buttons & QMessageBox::No ? QMessageBox::No : preset);
    box.FitButtons();
    const UsualCursor answering;
    return QMessageBox::StandardButton(box.exec());
}

class ProgressBox : public Progress {
public:
    ProgressBox(QString what, qint64 total)
        : what_(LinesOf(std::move(what)))
        , total_(total)
        , box_(FrontWindow())
    {
        box_.setWindowTitle(QApplication::applicationDisplayName());
        auto* label = new QLabel(&box_);
        label->setWordWrap(true);
        label->setAlignment(Qt::AlignCenter);
        box_.setLabel(label);
        box_.setLabelText(what_);
        box_.setMinimumWidth(RoomFor(box_.parentWidget(), box_.fontMetrics()));
        WorkShown().push_back(&box_);
        box_.setRange(0, total > 0 ? kSteps : 0);
        box_.setWindowModality(Qt::ApplicationModal);
        box_.setMinimumDuration(kMomentMs);
        box_.setAutoClose(false);
        box_.setAutoReset(false);
        box_.setValue(0);
        QGuiApplication::setOverrideCursor(Qt::WaitCursor);
        sinceRepaint_.start();
    }

    ~ProgressBox() override
    {
        std::erase(WorkShown(), &box_);
        QGuiApplication::restoreOverrideCursor();
    }
    Q_DISABLE_COPY_MOVE(ProgressBox)

    bool Advance(qint64 done) override
    {
        if (sinceRepaint_.elapsed() < kRepaintMs)
            return !box_.wasCanceled();
        sinceRepaint_.restart();
        const QLocale locale;
        if (total_ > 0) {
            box_.setLabelText(what_ + u'\n' +
                              StringText(Str::ProgressCount, {locale.toString(done), locale.toString(total_)}));
            box_.setValue(int(std::clamp<qint64>(done * kSteps / total_, 0, kSteps)));
        } else {
            box_.setLabelText(what_ + u'\n' + locale.toString(done));
            box_.setValue(0);
        }
        // Until the box stands there and blocks them, keys and taps wait: they must reach no window whose records
        // are being worked on.
        QCoreApplication::processEvents(box_.isVisible() ? QEventLoop::AllEvents
                                                         : QEventLoop::ExcludeUserInputEvents);
        return !box_.wasCanceled();
    }

private:
    QString what_;
    qint64 total_;
    QProgressDialog box_;
    QElapsedTimer sinceRepaint_;
};

} // namespace

bool MessageBoxPrompt::AskYesNo(const UserMessage& question)
{
    return AskYesNoWith(question, {});
}

bool MessageBoxPrompt::AskYesNoWith(const UserMessage& question, const Details& details)
{
    const auto preset = details.preset == Preset::Yes ? QMessageBox::Yes : QMessageBox::No;
    return Ask(question.Text(), details.note, QMessageBox::Question, QMessageBox::Yes | QMessageBox::No, preset) ==
           QMessageBox::Yes;
}

UserPrompt::Answer MessageBoxPrompt::AskYesNoOr(const UserMessage& question, const UserMessage& third)
{
    const WorkHidden hidden;
    WideBox box(QMessageBox::Question, question.Text(), {}, QMessageBox::Yes | QMessageBox::No);
    const QAbstractButton* other = box.addButton(third.Text(), QMessageBox::AcceptRole);
    box.setDefaultButton(QMessageBox::No);
    box.setEscapeButton(QMessageBox::No);
    box.FitButtons();
    const int pressed = box.exec();
    if (box.clickedButton() == other)
        return Answer::Third;
    return pressed == QMessageBox::Yes ? Answer::Yes : Answer::No;
}

void MessageBoxPrompt::Show(const UserMessage& message)
{
    Ask(message.Text(), {}, QMessageBox::Information, QMessageBox::Ok, QMessageBox::Ok);
}

void MessageBoxPrompt::ShowError(const QString& text)
{
    ShowErrorWithReason(text, {});
}

void MessageBoxPrompt::ShowErrorWithReason(const QString& text, const QString& reason)
{
    Ask(text, reason, QMessageBox::Critical, QMessageBox::Ok, QMessageBox::Ok);
}

std::optional<QString> MessageBoxPrompt::AskText(const UserMessage& title, const UserMessage& label,
                                                 const QString& preset)
{
    bool accepted = false;
    const WorkHidden hidden;
    const UsualCursor answering;
    const QString text = QInputDialog::getText(FrontWindow(), title.Text(), LinesOf(label.Text()),
                                               QLineEdit::Normal, preset, &accepted);
    return accepted ? std::optional(text) : std::nullopt;
}

std::unique_ptr<Progress> MessageBoxPrompt::StartProgress(const UserMessage& what, qint64 total)
{
    return std::make_unique<ProgressBox>(what.Text(), total);
}

} // namespace mirel
