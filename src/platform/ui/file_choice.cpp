#include "platform/ui/file_choice.h"

#include "platform/folder_choice.h"
#include "platform/ui/elided_label.h"
#include "platform/ui/entry_list.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QCheckBox>
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

QString WithoutMnemonic(Str text)
{
    return StringText(text).remove(u'&');
}

// The file dialog of a small screen: fills the window, one list, one line for the name.
class CFileDialog : public QDialog {
public:
    CFileDialog(const FolderChoice& choice, const FileRequest& request, QWidget* parent)
        : QDialog(parent)
        , choice_(choice)
        , use_(request.use)
        , icon_(request.kind.icon)
        , endings_(request.kind.endings)
        , up_(new QToolButton(this))
        , folder_(new ElidedLabel(this))
        , list_(new EntryList(this))
        , name_(new QLineEdit(this))
        , all_(new QCheckBox(StringText(Str::ShowAllFiles), this))
        , buttons_(new QDialogButtonBox(QDialogButtonBox::Cancel, this))
    {
        accept_ = buttons_->addButton(StringText(request.accept), QDialogButtonBox::AcceptRole);
        up_->setIcon(ThemeIcon(u"go-up"));
        up_->setToolTip(StringText(Str::FolderUp));
        up_->setAccessibleName(StringText(Str::FolderUp));
        list_->setAccessibleName(StringText(Str::FolderContents));
        name_->setPlaceholderText(StringText(Str::FileName));
        name_->setAccessibleName(StringText(Str::FileName));
        name_->setVisible(use_ == FileUse::Create);
        name_->setText(request.name);
        all_->setVisible(!request.kind.others.empty());
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
        lines->addWidget(all_);
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
        connect(all_, &QCheckBox::toggled, this, [this](bool all) {
            choice_ = FolderChoice(choice_.Folder(), all ? QStringList(QString()) : endings_);
            ShowFolder();
        });
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
                             .icon = entry.folder ? QStringView(u"folder") : icon_});
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
    QStringView icon_;
    QStringList endings_;
    std::vector<FolderChoice::Entry> entries_;
    QString path_;
    QToolButton* up_;
    ElidedLabel* folder_;
    EntryList* list_;
    QLineEdit* name_;
    QCheckBox* all_;
    QDialogButtonBox* buttons_;
    QPushButton* accept_;
};

QString ChooseOnSmallScreen(QWidget& parent, const FileRequest& request, const FolderChoice& choice)
{
    CFileDialog dialog(choice, request, &parent);
    dialog.setWindowTitle(WithoutMnemonic(request.title));
    dialog.resize(parent.size());
    return dialog.exec() == QDialog::Accepted ? dialog.Path() : QString();
}

} // namespace

FileKind FileKind::Database()
{
    return {Str::DatabaseFilter, {u".cdb"_s}, u"mirel-database", {Str::SqliteFilter, Str::AllFilesFilter}};
}

QString ChooseFile(QWidget& parent, const FileRequest& request)
{
    const QString folder = request.near.isEmpty()
                               ? QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation)
                               : QFileInfo(request.near).path();
    const FolderChoice choice(folder, request.kind.endings);
    if (IsHandheldSize(parent.size()))
        return ChooseOnSmallScreen(parent, request, choice);
    const bool create = request.use == FileUse::Create;
    QStringList filters{StringText(request.kind.filter)};
    for (const Str other : request.kind.others)
        filters += StringText(other);
    QFileDialog dialog(&parent, WithoutMnemonic(request.title), choice.Folder(), filters.join(u";;"_s));
    dialog.setAcceptMode(create ? QFileDialog::AcceptSave : QFileDialog::AcceptOpen);
    dialog.setFileMode(create ? QFileDialog::AnyFile : QFileDialog::ExistingFile);
    dialog.setOption(QFileDialog::DontConfirmOverwrite);
    dialog.setLabelText(QFileDialog::Accept, WithoutMnemonic(request.accept));
    if (!request.name.isEmpty())
        dialog.selectFile(request.name);
    return dialog.exec() == QDialog::Accepted ? dialog.selectedFiles().value(0) : QString();
}

} // namespace mirel
