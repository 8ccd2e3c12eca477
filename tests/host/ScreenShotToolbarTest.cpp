#include "host/access/clsScreenShotToolbar.h"

#include "host/access/LateBound.h"
#include "platform/access/CommandBars.h"
#include "support/FakeEnvironment.h"

namespace tovimar::test {
namespace {

/// An application that only has its bars.
class BarsHost : public AutomationObject {
public:
    std::string ClassName() const override { return "Application"; }
    Value Get(std::string_view, const Arguments& arguments) override {
        return arguments.empty() ? Value(bars) : bars->Get("Item", arguments);
    }
    void Set(std::string_view, const Value&) override {}
    Value Call(std::string_view member, const Arguments& arguments) override {
        return Get(member, arguments);
    }

    HostObject bars = platform::access::MakeCommandBars();
};

TEST(ScreenShotToolbarTest, ComesOnceWithItsButtonAndGoes) {
    const auto host = std::make_shared<BarsHost>();
    clsScreenShotToolbar toolbar;
    toolbar.Show(host, clsScreenShotToolbar::kName);
    toolbar.Show(host, clsScreenShotToolbar::kName);
    EXPECT_EQ(late::Integer(host->bars, "Count"), 2) << "the menu bar and this one";
    const HostObject bar = late::Object(host, "CommandBars", {Value("vasmora screenshot")});
    EXPECT_TRUE(late::Flag(bar, "Visible"));
    EXPECT_EQ(late::Integer(late::Object(bar, "Controls"), "Count"), 1);
    const HostObject button = late::Object(bar, "Controls", {1});
    EXPECT_EQ(late::Text(button, "Caption"), "&Screenshot");
    EXPECT_EQ(late::Integer(button, "Style"), 2) << "its text, no picture";
    EXPECT_THROW(late::Call(host->bars, "Add", {Value("Menu Bar")}), RaisedError);
    toolbar.Delete(host, clsScreenShotToolbar::kName);
    toolbar.Delete(host, clsScreenShotToolbar::kName);
    EXPECT_EQ(late::Integer(host->bars, "Count"), 1);
}

} // namespace
} // namespace tovimar::test
