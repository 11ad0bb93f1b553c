#include "screens/toolkit/Screen.h"

#include "doubles/FakeScreen.h"
#include "screens/toolkit/ActivityIndicator.h"
#include "screens/toolkit/Control.h"
#include "screens/toolkit/Label.h"
#include "screens/toolkit/TextField.h"

#include <gtest/gtest.h>

namespace orvane
{

TEST(ScreenTest, WithoutAFrontEndThereIsNothingToSee)
{
    EXPECT_EQ(Screen::main().bounds(), Rect());
    EXPECT_EQ(Screen::main().sizeWithFont("text", Font::system(14)), Size());
    EXPECT_EQ(Screen::main().loadInterface("any"), nullptr);
    View().setHidden(true);
}

TEST(ScreenTest, AScreenThatEndsIsTheMainOneNoLonger)
{
    {
        const FakeScreen screen;
        EXPECT_EQ(&Screen::main(), &screen);
    }
    EXPECT_EQ(Screen::main().bounds(), Rect());
}

TEST(ScreenTest, EveryChangeAsksForAnUpdateAndNothingElseDoes)
{
    const FakeScreen screen;
    Label label;
    const auto updatesOf = [&](auto change) {
        const int before = screen.updateCount();
        change();
        return screen.updateCount() - before;
    };
    EXPECT_EQ(updatesOf([&] { label.setText("x"); }), 1);
    EXPECT_EQ(updatesOf([&] { label.setText("x"); }), 0);
    EXPECT_EQ(updatesOf([&] { label.sizeToFit(); }), 1);
    EXPECT_EQ(updatesOf([&] { label.sizeToFit(); }), 0);
    EXPECT_EQ(updatesOf([&] { label.setHidden(true); }), 1);
    EXPECT_EQ(updatesOf([&] { label.setHidden(true); }), 0);
}

TEST(ScreenTest, AlertsWaitForTheOneInFront)
{
    FakeScreen screen;
    screen.dismissAlert();
    screen.showAlert(std::make_unique<AlertView>("first", "m", "Close"));
    screen.showAlert(std::make_unique<AlertView>("second", "m", "Close"));
    EXPECT_EQ(screen.alert()->title(), "first");
    screen.dismissAlert();
    EXPECT_EQ(screen.alert()->title(), "second");
    screen.dismissAlert();
    EXPECT_EQ(screen.alert(), nullptr);
}

TEST(ViewTest, AViewHasOneSuperview)
{
    const auto view = std::make_shared<View>();
    View first;
    {
        View second;
        first.addSubview(view);
        second.addSubview(view);
        second.addSubview(nullptr);
        EXPECT_TRUE(first.subviews().empty());
        EXPECT_EQ(view->superview(), &second);
    }
    EXPECT_EQ(view->superview(), nullptr);
    view->removeFromSuperview();
}

TEST(LabelTest, SizeToFitKeepsThePlace)
{
    const FakeScreen screen;
    Label label;
    label.setFont(Font::boldSystem(14));
    label.setText("four");
    label.setFrame({5, 6, 1, 1});
    label.sizeToFit();
    EXPECT_EQ(label.frame(), (Rect{5, 6, 36, 17}));
    label.setText(std::nullopt);
    EXPECT_EQ(label.text(), "");
}

TEST(ActivityIndicatorTest, HidesWhenStoppedIfItIsToldTo)
{
    ActivityIndicator indicator;
    EXPECT_FALSE(indicator.isHidden());
    indicator.setHidesWhenStopped(true);
    EXPECT_TRUE(indicator.isHidden());
    indicator.startAnimating();
    EXPECT_FALSE(indicator.isHidden());
    indicator.stopAnimating();
    EXPECT_TRUE(indicator.isHidden());
}

TEST(TextFieldTest, ReturnGoesToTheDelegate)
{
    class Delegate final : public TextFieldDelegate
    {
    public:
        bool textFieldShouldReturn(TextField& field) override
        {
            return field.resignFirstResponder();
        }
    } delegate;
    TextField field;
    field.pressReturn();
    field.setDelegate(&delegate);
    field.becomeFirstResponder();
    field.pressReturn();
    EXPECT_FALSE(field.isFirstResponder());
}

TEST(ControlTest, AnActionMayDestroyItsControl)
{
    auto control = std::make_unique<Control>();
    control->press();
    control->setAction([&] { control.reset(); });
    control->press();
    EXPECT_EQ(control, nullptr);
}

} // namespace orvane
