#pragma once

#include "forms/control_source.h"
#include "forms/ui/property_editors.h"

class QPushButton;
class QTableWidget;

namespace mirel {

// The columns of a list, or the assignments of a button, as a table of two columns: a name and an expression.
class PairEditor : public PropertyEditor {
    Q_OBJECT
public:
    PairEditor(const PropertyDef& def, const SheetContext& context, QWidget* parent);

    void Show(const QString& value) override;
    bool IsWide() const override { return true; }

private:
    struct Pair {
        QString first;
        QString second;

        friend bool operator==(const Pair&, const Pair&) = default;
    };
    bool AreColumns() const { return kind_ == PropertyKind::Columns; }
    std::vector<Pair> Split(const QString& source) const;
    QString Joined() const;
    std::vector<Pair> Shown() const;
    void Fill(const std::vector<Pair>& pairs);
    void Tell();
    void Add();
    void AddAllFields();
    void Remove();
    void Move(int by);
    void OpenDesk();
    void ShowButtons();

    PropertyKind kind_;
    SheetContext context_;
    QTableWidget* table_;
    QPushButton* remove_;
    QPushButton* up_;
    QPushButton* down_;
    QPushButton* desk_;
    bool showing_ = false;
};

} // namespace mirel
