#include "app/ui/file_choice.h"

#include "app/folder_choice.h"
#include "app/ui/elided_label.h"
#include "app/ui/entry_list.h"
#include "app/ui/window_place.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QLineEdit>
#include <QPushButton>
#include <QStandardPaths>
#include <QToolButton>
#include <QVBoxLayout>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

QString AcceptText(FileUse use)
{
    switch (use) {
    case FileUse::Open:
        return StringText(Str::CommandOpen);
    case FileUse::Create:
        return StringText(Str::CommandNew);
    case FileUse::Delete:
        break;
    }
    return StringText(Str::CommandDelete);
}

// The file dialog of a small screen: fills the window, one list, one line for the name.
class CFileDialog : public QDialog {
public:
    CFileDialog(const FolderChoice& choice, FileUse use, QWidget* parent)
        : QDialog(parent)
        , choice_(choice)
        , use_(use)
        , up_(new QToolButton(this))
        , folder_(new ElidedLabel(this))
        , list_(new EntryList(this))
        , name_(new QLineEdit(this))
        , buttons_(new QDialogButtonBox(QDialogButtonBox::Cancel, this))
    {
        accept_ = buttons_->addButton(AcceptText(use), QDialogButtonBox::AcceptRole);
        up_->setIcon(ThemeIcon(u"go-up"));
        up_->setToolTip(StringText(Str::FolderUp));
        up_->setAccessibleName(StringText(Str::FolderUp));
        list_->setAccessibleName(StringText(Str::FolderContents));
        name_->setPlaceholderText(StringText(Str::FileName));
        name_->setAccessibleName(StringText(Str::FileName));
        name_->setVisible(use == FileUse::Create);
        LayOut();
        Connect();
        ShowFolder();
    }

    QString Path() const { return path_; }

private:
    void LayOut()
    {
        auto* top = new QHBoxLayout;
        top->addWidget(up_);
        top->addWidget(folder_, 1);
        auto* lines = new QVBoxLayout(this);
        lines->addLayout(top);
        lines->addWidget(list_, 1);
        lines->addWidget(name_);
        lines->addWidget(buttons_);
        (use_ == FileUse::Create ? static_cast<QWidget*>(name_) : list_)->setFocus();
    }

    void Connect()
    {
        connect(up_, &QToolButton::clicked, this, [this] {
            choice_.GoUp();
            ShowFolder();
        });
        connect(list_, &EntryList::RowChanged, this, [this](int row) {
            if (row >= 0 && !entries_[size_t(row)].folder)
                name_->setText(entries_[size_t(row)].name);
        });
        connect(list_, &EntryList::Tapped, this, [this](int row, Tap tap) {
            if (tap == (entries_[size_t(row)].folder ? Tap::Single : Tap::Double))
                Take(entries_[size_t(row)].name);
        });
        connect(list_, &EntryList::EnterPressed, this, [this](int row) { Take(entries_[size_t(row)].name); });
        connect(name_, &QLineEdit::textChanged, this,
                [this](const QString& text) { accept_->setEnabled(!text.trimmed().isEmpty()); });
        connect(buttons_, &QDialogButtonBox::accepted, this, [this] { Take(name_->text().trimmed()); });
        connect(buttons_, &QDialogButtonBox::rejected, this, &QDialog::reject);
    }

    void Take(const QString& name)
    {
        if (name.isEmpty())
            return;
        if (choice_.Enter(name)) {
            ShowFolder();
            return;
        }
        path_ = choice_.PathOf(name);
        accept();
    }

    void ShowFolder()
    {
        entries_ = choice_.Entries();
        std::vector<EntryLine> lines;
        for (const FolderChoice::Entry& entry : entries_) {
            lines.push_back({.name = entry.name,
                             .detail = {},
                             .toolTip = {},
                             .icon = entry.folder ? QStringView(u"folder") : QStringView(u"mirel-database")});
        }
        list_->SetLines(std::move(lines));
        folder_->SetText(QDir::toNativeSeparators(choice_.Folder()));
        folder_->setToolTip(folder_->Text());
        up_->setEnabled(choice_.CanGoUp());
        if (use_ != FileUse::Create)
            name_->clear();
        accept_->setEnabled(!name_->text().isEmpty());
    }

    FolderChoice choice_;
    FileUse use_;
    std::vector<FolderChoice::Entry> entries_;
    QString path_;
    QToolButton* up_;
    ElidedLabel* folder_;
    EntryList* list_;
    QLineEdit* name_;
    QDialogButtonBox* buttons_;
    QPushButton* accept_;
};

QString ChooseOnSmallScreen(QWidget& parent, const QString& caption, FileUse use, const FolderChoice& choice)
{
    CFileDialog dialog(choice, use, &parent);
    dialog.setWindowTitle(caption);
    dialog.resize(parent.size());
    return dialog.exec() == QDialog::Accepted ? dialog.Path() : QString();
}

} // namespace

QString ChooseDatabase(QWidget& parent, Str title, FileUse use, const QString& near)
{
    const QString folder = near.isEmpty() ? QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation)
                                          : QFileInfo(near).path();
    const FolderChoice choice(folder, u".cdb"_s);
    const QString caption = StringText(title).remove(u'&');
    if (IsHandheldSize(parent.size()))
        return ChooseOnSmallScreen(parent, caption, use, choice);
    QFileDialog dialog(&parent, caption, choice.Folder(), StringText(Str::DatabaseFilter));
    dialog.setAcceptMode(use == FileUse::Create ? QFileDialog::AcceptSave : QFileDialog::AcceptOpen);
    dialog.setFileMode(use == FileUse::Create ? QFileDialog::AnyFile : QFileDialog::ExistingFile);
    dialog.setOption(QFileDialog::DontConfirmOverwrite);
    dialog.setLabelText(QFileDialog::Accept, AcceptText(use).remove(u'&'));
    return dialog.exec() == QDialog::Accepted ? dialog.selectedFiles().value(0) : QString();
}

} // namespace mirel
