#include "app/ui/message_box_prompt.h"

#include "platform/ui/wait_cursor.h"
#include "resources/string_table.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QInputDialog>
#include <QLocale>
#include <QMessageBox>
#include <QProgressDialog>
#include <QPushButton>

#include <algorithm>
#include <utility>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kMomentMs = 400; // work that ends within it shows no box
constexpr int kRepaintMs = 50;
constexpr int kSteps = 1000; // of the bar: totals may pass what a bar counts to

QWidget* FrontWindow()
{
    QWidget* modal = QApplication::activeModalWidget();
    return modal ? modal : QApplication::activeWindow();
}

// The system's texts break lines as the handheld did.
QString LinesOf(QString text)
{
    return text.replace(u"\r\n"_s, u"\n"_s);
}

QMessageBox::StandardButton Ask(const QString& text, QMessageBox::Icon icon, QMessageBox::StandardButtons buttons,
                                QMessageBox::StandardButton preset)
{
    QMessageBox box(icon, QApplication::applicationDisplayName(), LinesOf(text), buttons, FrontWindow());
    box.setTextFormat(Qt::PlainText);
    box.setDefaultButton(preset);
    box.setEscapeButton(preset);
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
        box_.setLabelText(what_);
        box_.setRange(0, total > 0 ? kSteps : 0);
        box_.setWindowModality(Qt::ApplicationModal);
        box_.setMinimumDuration(kMomentMs);
        box_.setAutoClose(false);
        box_.setAutoReset(false);
        box_.setValue(0);
        QGuiApplication::setOverrideCursor(Qt::WaitCursor);
        sinceRepaint_.start();
    }

    ~ProgressBox() override { QGuiApplication::restoreOverrideCursor(); }
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
    return Ask(question.Text(), QMessageBox::Question, QMessageBox::Yes | QMessageBox::No, QMessageBox::No) ==
           QMessageBox::Yes;
}

UserPrompt::Answer MessageBoxPrompt::AskYesNoOr(const UserMessage& question, const UserMessage& third)
{
    QMessageBox box(QMessageBox::Question, QApplication::applicationDisplayName(), LinesOf(question.Text()),
                    QMessageBox::Yes | QMessageBox::No, FrontWindow());
    const QAbstractButton* other = box.addButton(third.Text(), QMessageBox::AcceptRole);
    box.setTextFormat(Qt::PlainText);
    box.setDefaultButton(QMessageBox::No);
    box.setEscapeButton(QMessageBox::No);
    const int pressed = box.exec();
    if (box.clickedButton() == other)
        return Answer::Third;
    return pressed == QMessageBox::Yes ? Answer::Yes : Answer::No;
}

void MessageBoxPrompt::Show(const UserMessage& message)
{
    Ask(message.Text(), QMessageBox::Information, QMessageBox::Ok, QMessageBox::Ok);
}

void MessageBoxPrompt::ShowError(const QString& text)
{
    Ask(text, QMessageBox::Critical, QMessageBox::Ok, QMessageBox::Ok);
}

std::optional<QString> MessageBoxPrompt::AskText(const UserMessage& title, const UserMessage& label,
                                                 const QString& preset)
{
    bool accepted = false;
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
