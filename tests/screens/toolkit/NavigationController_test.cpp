#include "screens/toolkit/NavigationController.h"

#include "doubles/FakeScreen.h"
#include "screens/toolkit/Window.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

std::vector<std::string>& notes()
{
    static std::vector<std::string> all;
    return all;
}

class NotingController final : public ViewController
{
public:
    explicit NotingController(std::string name) : _name(std::move(name)) {}
    void viewDidLoad() override { notes().push_back(_name + " loads"); }
    void viewWillAppear(bool animated) override
    {
        notes().push_back(_name + (animated ? " slides in" : " appears"));
    }
    void viewWillDisappear(bool) override { notes().push_back(_name + " leaves"); }

private:
    std::string _name;
};

class NotingDelegate final : public NavigationControllerDelegate
{
public:
    void willShowViewController(NavigationController& navigation, ViewController& controller,
                                bool) override
    {
        EXPECT_EQ(navigation.topViewController(), &controller);
        notes().push_back("will show");
    }
};

class NavigationControllerTest : public ::testing::Test
{
protected:
    NavigationControllerTest()
    {
        notes().clear();
        navigation.setDelegate(&delegate);
    }
    static std::vector<std::string> takeNotes() { return std::exchange(notes(), {}); }

    FakeScreen screen;
    std::shared_ptr<NotingController> root = std::make_shared<NotingController>("root");
    std::shared_ptr<NotingController> a = std::make_shared<NotingController>("a");
    std::shared_ptr<NotingController> b = std::make_shared<NotingController>("b");
    NotingDelegate delegate;
    NavigationController navigation{root};
};

} // namespace

TEST_F(NavigationControllerTest, TheRootAppearsWithTheWindow)
{
    const std::shared_ptr<NavigationController> shared(&navigation, [](auto*) {});
    Window window({0, 0, 320, 480});
    window.setRootViewController(shared);
    EXPECT_THAT(takeNotes(), IsEmpty());
    window.makeKeyAndVisible();
    EXPECT_THAT(takeNotes(), ElementsAre("root loads", "root appears", "will show"));
    EXPECT_EQ(screen.keyWindow(), &window);
    window.orderOut();
    EXPECT_EQ(screen.keyWindow(), nullptr);
}

TEST_F(NavigationControllerTest, PushAndPopTellWhoLeavesAndWhoComes)
{
    navigation.pushViewController(a, true);
    EXPECT_THAT(takeNotes(), ElementsAre("root leaves", "a loads", "a slides in", "will show"));
    EXPECT_EQ(a->navigationController(), &navigation);
    navigation.popViewController(false);
    EXPECT_THAT(takeNotes(), ElementsAre("a leaves", "root loads", "root appears", "will show"));
    EXPECT_EQ(a->navigationController(), nullptr);
    EXPECT_FALSE(navigation.isLastChangeAnimated());
}

TEST_F(NavigationControllerTest, TheRootStays)
{
    navigation.popViewController(true);
    navigation.pushViewController(root, true);
    navigation.pushViewController(nullptr, true);
    EXPECT_EQ(navigation.topViewController(), root.get());
    EXPECT_THAT(takeNotes(), IsEmpty());
}

TEST_F(NavigationControllerTest, PopsToOneThatIsOnTheStack)
{
    navigation.pushViewController(a, false);
    navigation.pushViewController(b, false);
    takeNotes();
    navigation.popToViewController(*root, true);
    EXPECT_THAT(takeNotes(), ElementsAre("b leaves", "root loads", "root slides in", "will show"));
    navigation.popToViewController(*a, true);
    EXPECT_THAT(takeNotes(), IsEmpty());
}

TEST_F(NavigationControllerTest, OneModalScreenAtATime)
{
    navigation.presentModalViewController(a, true);
    navigation.presentModalViewController(b, true);
    EXPECT_EQ(navigation.modalViewController(), a);
    EXPECT_THAT(takeNotes(), ElementsAre("a loads", "a slides in"));
    navigation.dismissModalViewController(true);
    navigation.dismissModalViewController(true);
    EXPECT_EQ(navigation.modalViewController(), nullptr);
    EXPECT_THAT(takeNotes(), ElementsAre("a leaves"));
}

TEST_F(NavigationControllerTest, WithoutARootThereIsNothing)
{
    NavigationController empty(nullptr);
    empty.viewWillAppear(false);
    empty.popViewController(true);
    EXPECT_EQ(empty.topViewController(), nullptr);
}

} // namespace orvane
