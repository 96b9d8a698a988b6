#pragma once

#include "forms/control_run.h"
#include "forms/ui/surface_scale.h"

#include <QObject>
#include <QStringList>
#include <QWidget>

#include <functional>
#include <memory>
#include <vector>

namespace mirel {

// One control of a running form as widgets: the window that shows it and, for two kinds of edit box, the strip
// beside it. Shows what the form's record of it says, and tells what the user does; keeps nothing.
//
// The widgets are children of the surface that was given; they bear the control's window identifier as their
// object name, the strip with ".strip" behind it.
class ControlWidget : public QObject {
    Q_OBJECT

public:
    // Reads the rows of a list: texts from `first` on, `count` of them.
    using RowReader = std::function<std::vector<QStringList>(qint64 first, int count)>;
    // What only a list needs.
    struct ListSource {
        RowReader rows;
        std::function<int()> maxColumnChars;        // as the options are now
        std::function<bool(int column)> isNumber{}; // shown to the right; null: none is
    };

    static std::unique_ptr<ControlWidget> Make(const ControlRun& control, const ListSource& list,
                                               QWidget& surface);
    ~ControlWidget() override;

    virtual void Show(const ControlRun& control) = 0;
    // Puts the widgets where the definition says, in the surface's pixels, with a font to match.
    virtual void Place(const SurfaceScale& scale);
    // The control shows what the form computes: nobody types into it.
    virtual void SetComputed() {}
    // A line of text that stands beside a box goes to the height of the box's, in the surface's pixels.
    virtual void AlignTextTo(const QWidget& box) { (void)box; }
    // The longer text or the calendar of an edit box, the items of a drop-down box. False: there is none.
    virtual bool OpenMore() { return false; }

    QWidget* Main() const { return main_; }
    QWidget* Strip() const { return strip_; } // null but for the two kinds of edit box

Q_SIGNALS:
    void textEdited(const QString& text);
    void ticked(bool on);
    void pressed();
    void rowChosen(qint64 row);
    void headerTapped(int column);
    void itemsWanted(); // comes before the items of a drop-down box are shown

protected:
    ControlWidget(const ControlRun& control, QWidget& main);

    void TakeStrip(QWidget& strip) { strip_ = &strip; }
    const ControlDef& Definition() const { return definition_; }
    // The room for a line of text in a box of that height.
    virtual int TextRoomPx(int heightPx) const { return heightPx; }
    void SetColors(QPalette::ColorRole background, QPalette::ColorRole text);

private:
    const ControlDef& definition_;
    QWidget* main_;
    QWidget* strip_ = nullptr;
};

} // namespace mirel
