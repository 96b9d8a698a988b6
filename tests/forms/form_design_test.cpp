#include "forms/design/form_design.h"

#include "forms/store_bytes.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <random>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

using Rects = std::vector<QRect>;

QByteArray BytesOf(const FormDef& form)
{
    FormStore::Content content;
    content.forms.push_back(form);
    return WriteStore(content);
}

FormDef FormOf(const Rects& places)
{
    FormDef form;
    form.SetName(u"Test");
    form.width = 235;
    form.height = 200;
    for (const QRect& place : places) {
        ControlDef control;
        control.type = ControlType::EditBox;
        control.controlId = qint32(form.controls.size()) + 1;
        control.name.Set(u"Box%1"_s.arg(form.controls.size() + 1));
        control.left = place.x();
        control.top = place.y();
        control.width = place.width();
        control.height = place.height();
        form.AddControl(control);
    }
    return form;
}

Rects PlacesOf(const FormDesign& design)
{
    Rects places;
    for (const ControlDef& control : design.Form().controls)
        places.push_back({control.left, control.top, control.width, control.height});
    return places;
}

QRect PlaceOf(const FormDesign& design, int control = 0)
{
    return PlacesOf(design)[size_t(control)];
}

// --- zones --------------------------------------------------------------------------------------------------

TEST(HitZone, TheFirstHandleThatHoldsThePointTakesIt)
{
    const Edges box{10, 10, 110, 50};
    struct Case {
        QPoint at;
        HitZone zone;
    };
    for (const Case& each : {
             Case{{10, 10}, HitZone::TopLeft}, Case{{109, 10}, HitZone::TopRight},
             Case{{10, 49}, HitZone::BottomLeft}, Case{{109, 49}, HitZone::BottomRight},
             Case{{60, 11}, HitZone::Top}, Case{{60, 48}, HitZone::Bottom}, Case{{11, 30}, HitZone::Left},
             Case{{108, 30}, HitZone::Right}, Case{{40, 30}, HitZone::Move},
             Case{{9, 10}, HitZone::None},   // where a drawn handle straddles the edge
             Case{{110, 49}, HitZone::None}, // the right edge is outside
         })
        EXPECT_EQ(int(ZoneAt(box, 8, each.at)), int(each.zone)) << each.at.x() << ',' << each.at.y();
    // Handles of a control that is as small as can be lie over one another: the order decides.
    EXPECT_EQ(ZoneAt({0, 0, 3, 3}, 8, {0, 0}), HitZone::TopLeft);
    EXPECT_EQ(ZoneAt({0, 0, 16, 16}, 8, {6, 6}), HitZone::Move) << "some of it is left to move it by";
    EXPECT_EQ(ZoneAt({2'000'000'000, 0, 4'000'000'000, 20}, 8, {2'000'000'000, 19}), HitZone::BottomLeft);
}

TEST(HitZone, EachZoneMovesItsEdges)
{
    struct Case {
        HitZone zone;
        Edges after;
    };
    const Edges box{10, 20, 110, 60};
    for (const Case& each :
         {Case{HitZone::Move, {13, 25, 113, 65}}, Case{HitZone::Left, {13, 20, 110, 60}},
          Case{HitZone::Right, {10, 20, 113, 60}}, Case{HitZone::Top, {10, 25, 110, 60}},
          Case{HitZone::Bottom, {10, 20, 110, 65}}, Case{HitZone::TopLeft, {13, 25, 110, 60}},
          Case{HitZone::TopRight, {10, 25, 113, 60}}, Case{HitZone::BottomLeft, {13, 20, 110, 65}},
          Case{HitZone::BottomRight, {10, 20, 113, 65}}, Case{HitZone::None, box}})
        EXPECT_TRUE(Dragged(box, each.zone, 3, 5) == each.after) << int(each.zone);
}

// --- drag ---------------------------------------------------------------------------------------------------

TEST(FormDesign, NeverDragsAControlBelowThreeByThree)
{
    FormDesign design(FormOf({{0, 0, 20, 10}}));
    design.SelectOnly(0);
    design.BeginDrag(HitZone::BottomRight, {20, 10});
    design.DragTo({2, -8});
    EXPECT_EQ(PlaceOf(design), QRect(0, 0, 20, 10)) << "the whole step is refused";
    design.DragTo({1, -9});
    EXPECT_EQ(PlaceOf(design), QRect(0, 0, 19, 9)) << "the refused point is where the next step begins";
    for (int step = 0; step < 40; ++step)
        design.DragTo({0 - step, -9});
    EXPECT_EQ(PlaceOf(design), QRect(0, 0, 3, 9));
    design.EndDrag();
    design.Undo();
    EXPECT_EQ(PlaceOf(design), QRect(0, 0, 20, 10)) << "a drag is one step";
    EXPECT_FALSE(design.CanUndo());
}

TEST(FormDesign, DragsAllThatIsSelectedAndPutsItBack)
{
    FormDesign design(FormOf({{0, 0, 20, 10}, {50, 0, 20, 10}, {100, 0, 20, 10}}));
    design.Select({2, 0});
    EXPECT_EQ(design.ZoneAt({105, 5}, 8), HitZone::Move);
    EXPECT_EQ(design.ZoneAt({100, 0}, 8), HitZone::Move) << "several have no handles";
    EXPECT_EQ(design.ZoneAt({55, 5}, 8), HitZone::None) << "not selected";
    const Rects before = PlacesOf(design);
    design.BeginDrag(HitZone::Move, {5, 5});
    design.DragTo({15, 25});
    EXPECT_EQ(PlacesOf(design), Rects({{10, 20, 20, 10}, {50, 0, 20, 10}, {110, 20, 20, 10}}));
    design.CancelDrag();
    EXPECT_EQ(PlacesOf(design), before);
    EXPECT_FALSE(design.IsModified());

    design.MoveBy(1, 0);
    design.BeginDrag(HitZone::Move, {5, 5});
    design.DragTo({15, 25});
    design.Undo(); // a key, while the stylus is down
    design.DragTo({35, 25});
    design.EndDrag();
    EXPECT_EQ(PlacesOf(design), before);
    EXPECT_TRUE(design.CanRedo());
}

TEST(FormDesign, BearsRectanglesOutsideAnyScreen)
{
    constexpr int kMost = std::numeric_limits<int>::max();
    constexpr int kLeast = std::numeric_limits<int>::min();
    FormDef form = FormOf({{0, 0, 5, 5}, {0, 0, 5, 5}});
    form.controls[0].left = kMost;
    form.controls[0].width = kMost;
    form.controls[1].left = kLeast;
    form.controls[1].width = -7;
    FormDesign design(form);
    EXPECT_EQ(design.ControlAt({0, 0}), -1);
    design.SelectAll();
    design.MoveBy(1, 1);
    design.MoveBy(-1, 0);
    design.ResizeBy(1, 1);
    design.Align(FormDesign::Edge::Right);
    design.Align(FormDesign::Edge::Left);
    design.MakeSame(FormDesign::Like::Size);
    design.SelectOnly(0);
    design.ChangeControl(0, [](ControlDef& control) {
        control.left = 10;
        control.width = 50;
    });
    EXPECT_EQ(design.ControlAt({20, 2}), 0) << "mended";
}

// --- selection ----------------------------------------------------------------------------------------------

TEST(FormDesign, TheLaterControlIsOnTopAndTheRubberBandTakesWhatItMeets)
{
    FormDesign design(FormOf({{0, 0, 50, 50}, {20, 20, 50, 50}, {200, 0, 10, 10}}));
    EXPECT_EQ(design.ControlAt({30, 30}), 1);
    EXPECT_EQ(design.ControlAt({5, 5}), 0);
    EXPECT_EQ(design.ControlAt({150, 150}), -1);
    design.SelectWithin({60, 60, 5, 5});
    EXPECT_EQ(design.Selection(), std::vector<int>({1}));
    design.SelectWithin({0, 0, 300, 300});
    EXPECT_EQ(design.Selection().size(), 3U);
    design.Toggle(1);
    EXPECT_EQ(design.Selection(), std::vector<int>({0, 2}));
    design.Toggle(1);
    EXPECT_EQ(design.Selection(), std::vector<int>({0, 2, 1})) << "in the order of selecting";
    design.SelectNone();
    design.SelectNext(1);
    EXPECT_EQ(design.TheSelected(), 0);
    design.SelectNext(-1);
    EXPECT_EQ(design.TheSelected(), 2) << "round the list";
}

TEST(FormDesign, AlignsAndMakesLikeTheOneSelectedFirst)
{
    const Rects places = {{0, 0, 20, 10}, {50, 40, 30, 16}, {100, 90, 8, 6}};
    struct Case {
        const char* what;
        std::function<void(FormDesign&)> change;
        Rects after;
    };
    using E = FormDesign::Edge;
    using L = FormDesign::Like;
    const std::vector<Case> cases = {
        {"left", [](FormDesign& d) { d.Align(E::Left); }, {{50, 0, 20, 10}, {50, 40, 30, 16}, {50, 90, 8, 6}}},
        {"right", [](FormDesign& d) { d.Align(E::Right); }, {{60, 0, 20, 10}, {50, 40, 30, 16}, {72, 90, 8, 6}}},
        {"top", [](FormDesign& d) { d.Align(E::Top); }, {{0, 40, 20, 10}, {50, 40, 30, 16}, {100, 40, 8, 6}}},
        {"bottom",
         [](FormDesign& d) { d.Align(E::Bottom); },
         {{0, 46, 20, 10}, {50, 40, 30, 16}, {100, 50, 8, 6}}},
        {"size",
         [](FormDesign& d) { d.MakeSame(L::Size); },
         {{0, 0, 30, 16}, {50, 40, 30, 16}, {100, 90, 30, 16}}},
        {"height",
         [](FormDesign& d) { d.MakeSame(L::Height); },
         {{0, 0, 20, 16}, {50, 40, 30, 16}, {100, 90, 8, 16}}},
        {"width",
         [](FormDesign& d) { d.MakeSame(L::Width); },
         {{0, 0, 30, 10}, {50, 40, 30, 16}, {100, 90, 30, 6}}},
    };
    for (const Case& each : cases) {
        FormDesign design(FormOf(places));
        design.Select({1, 2, 0});
        each.change(design);
        EXPECT_EQ(PlacesOf(design), each.after) << each.what;
        design.Undo();
        EXPECT_EQ(PlacesOf(design), places) << each.what;
    }
}

// --- new controls, copies -----------------------------------------------------------------------------------

TEST(FormDesign, NewControlsHaveFreeNamesAndIdsAndTheFormsLook)
{
    FormDef form = FormOf({{0, 0, 20, 10}});
    form.controls[0].controlId = std::numeric_limits<qint32>::max();
    form.controls[0].name.Set(u"editbox1");
    form.textStyle.pointSize = 12;
    form.backgroundColor = 0x112233;
    FormDesign design(form);
    for (const ControlTypeDef& type : ControlTypes()) {
        design.AddControl(type.type, {220, 150});
        const ControlDef& made = design.Control(design.TheSelected());
        EXPECT_EQ(int(made.type), int(type.type));
        EXPECT_EQ(made.textStyle, design.Form().textStyle);
        EXPECT_NE(made.windowStyle, 0U);
        EXPECT_GT(made.controlId, 0);
        EXPECT_LE(made.left + made.width, 235) << "moved into the form";
        const bool takes = type.type == ControlType::Label || type.type == ControlType::CheckBox;
        EXPECT_EQ(made.backgroundColor == 0x112233, takes);
    }
    EXPECT_EQ(design.Control(2).name.Text(), u"EditBox2"_s) << "the other is taken, case apart";
    EXPECT_GE(design.Form().height, 160) << "the form grows with what is put on it";
    design.InsertRecordCounter();
    EXPECT_EQ(design.Control(design.TheSelected()).controlId, 0);
    design.InsertRecordCounter();
    EXPECT_NE(design.Control(design.TheSelected()).controlId, 0);
    QSet<qint32> ids;
    for (const ControlDef& control : design.Form().controls)
        ids += control.controlId;
    EXPECT_EQ(ids.size(), design.Count());
}

TEST(FormDesign, PastesOnAnotherFormAndRefusesForeignBytes)
{
    FormDef form = FormOf({{0, 0, 20, 10}, {50, 40, 30, 16}});
    form.controls[1].reserved[3] = 7;
    form.controls[1].SetSource(u"T.F");
    form.controls[1].type = ControlType(777);
    FormDesign from(form);
    from.Select({1, 0}); // they keep the form's order
    const QByteArray copied = from.CopySelected();
    FormDesign to{FormDef()};
    ASSERT_TRUE(to.Paste(copied));
    ASSERT_EQ(to.Count(), 2);
    EXPECT_EQ(to.Control(1).reserved[3], 7) << "all that a control has comes along";
    EXPECT_EQ(to.Control(1).source.Text(), u"T.F"_s);
    EXPECT_EQ(to.Selection(), std::vector<int>({0, 1}));
    ASSERT_TRUE(to.Paste(copied));
    EXPECT_EQ(PlaceOf(to, 2), QRect(8, 8, 20, 10)) << "not over the first copy";
    EXPECT_EQ(to.Control(2).name.Text(), u"Box12"_s) << "with a name of its own";
    const QByteArray before = BytesOf(to.Form());
    for (const QByteArray& bytes : {QByteArray(), QByteArray("x"), copied.left(300), QByteArray(5000, '\xff')})
        EXPECT_FALSE(to.Paste(bytes));
    EXPECT_EQ(BytesOf(to.Form()), before);
}

TEST(FormDesign, DeletesTheSelectedInWhateverOrderTheyWereSelected)
{
    for (const std::vector<int>& selected : {std::vector{0, 2}, std::vector{2, 0}}) {
        FormDesign design(FormOf({{0, 0, 20, 10}, {0, 20, 20, 10}, {0, 40, 20, 10}, {0, 60, 20, 10}}));
        const QByteArray before = BytesOf(design.Form());
        design.Select(selected);
        design.DeleteSelected();
        EXPECT_EQ(PlacesOf(design), (Rects{{0, 20, 20, 10}, {0, 60, 20, 10}}));
        design.Undo();
        EXPECT_EQ(BytesOf(design.Form()), before);
        EXPECT_EQ(design.Selection(), selected);
    }
}

// --- the way back -------------------------------------------------------------------------------------------

TEST(FormDesign, KnowsWhetherItIsTheSavedOne)
{
    FormDesign design(FormOf({{0, 0, 20, 10}}));
    EXPECT_FALSE(design.IsModified());
    design.SelectAll();
    EXPECT_FALSE(design.IsModified()) << "selecting changes nothing";
    design.MoveBy(1, 0);
    design.MoveBy(1, 0);
    EXPECT_TRUE(design.IsModified());
    design.Undo();
    EXPECT_EQ(PlaceOf(design), QRect(0, 0, 20, 10)) << "arrow keys one after the other are one step";
    EXPECT_FALSE(design.IsModified()) << "back at what was saved";
    design.Redo();
    design.MarkSaved();
    design.MoveBy(1, 0);
    EXPECT_TRUE(design.IsModified()) << "does not join the step that was saved";
    design.Undo();
    EXPECT_FALSE(design.IsModified());
    design.Undo();
    design.MoveBy(0, 5);
    EXPECT_TRUE(design.IsModified()) << "the saved state is gone for good";
    design.Undo();
    EXPECT_TRUE(design.IsModified());
}

TEST(FormDesign, AThousandStepsLeadBackByteForByte)
{
    std::mt19937 random(4711);
    const auto below = [&random](int limit) { return int(random() % unsigned(limit)); };
    FormDesign design(FormOf({{0, 0, 20, 10}, {50, 40, 30, 16}}));
    const QByteArray first = BytesOf(design.Form());
    std::vector<QByteArray> states{first};
    QByteArray copied;
    while (states.size() <= 1000) {
        if (design.Count() > 0 && below(3) == 0)
            design.SelectOnly(below(design.Count()));
        switch (below(9)) {
        case 0:
            design.AddControl(ControlTypes()[size_t(below(6))].type, {below(300) - 20, below(300) - 20});
            break;
        case 1:
            design.MoveBy(below(9) - 4, below(9) - 4);
            break;
        case 2:
            design.SelectAll();
            design.MakeSame(FormDesign::Like(below(3)));
            break;
        case 3:
            if (below(4) == 0)
                design.DeleteSelected();
            break;
        case 4:
            copied = design.CopySelected();
            if (design.Count() < 40)
                (void)design.Paste(copied);
            break;
        case 5:
            design.BeginDrag(HitZone(below(10)), {0, 0});
            design.DragTo({below(60) - 30, below(60) - 30});
            design.DragTo({below(60) - 30, below(60) - 30});
            design.EndDrag();
            break;
        case 6:
            design.MoveInOrder(below(5) - 2);
            break;
        case 7:
            design.Change([&](FormDef& form) { form.SetName(u"Name %1"_s.arg(below(1000))); });
            break;
        default:
            design.Align(FormDesign::Edge(below(4)));
            break;
        }
        design.Select(design.Selection());
        const QByteArray now = BytesOf(design.Form());
        if (now != states.back())
            states.push_back(now);
    }
    int steps = 0;
    while (design.CanUndo()) {
        design.Undo();
        ++steps;
    }
    EXPECT_EQ(BytesOf(design.Form()), first);
    EXPECT_GT(steps, 500);
    while (design.CanRedo())
        design.Redo();
    EXPECT_EQ(BytesOf(design.Form()), states.back());
}

} // namespace
} // namespace mirel
