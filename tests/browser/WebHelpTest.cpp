#include "browser/Browser.h"
#include "cli/Program.h"

#include <gtest/gtest.h>

#include <memory>

namespace tovimar::test {
namespace {

/// The sample's web help, made once.
class SampleHelp : public ProgramTest {
public:
    SampleHelp() {
        Run({"generate", kSample, "--output", "help", "--copy-to", ".", "--no-compile"}).ExpectExit(0);
    }
    void TestBody() override {}
    fs::path Help() const { return Folder() / "help"; }
};

enum class From { Disk, Server };

/// The web help in a real browser, from a file address and from a server.
class WebHelpInBrowserTest : public ::testing::TestWithParam<From> {
protected:
    static void SetUpTestSuite() {
        if (!Browser::IsInstalled())
            return;
        sample = std::make_unique<SampleHelp>();
        server = std::make_unique<FolderServer>(sample->Help());
        browser = std::make_unique<Browser>();
    }
    static void TearDownTestSuite() {
        browser.reset();
        server.reset();
        sample.reset();
    }
    void SetUp() override {
        if (browser == nullptr)
            GTEST_SKIP() << "chromedriver isn't installed; ./check installs it (chromium-driver)";
    }
    void TearDown() override {
        if (browser == nullptr)
            return;
        browser->LookAtPage();
        browser->Command("Emulation.clearDeviceMetricsOverride", nlohmann::json::object());
        browser->Command("Emulation.setEmulatedMedia", {{"features", nlohmann::json::array()}});
    }

    static std::string Address(const std::string& page) {
        return GetParam() == From::Disk ? "file://" + (sample->Help() / page).string()
                                        : server->Address() + page;
    }
    /// Opens the frame page and waits for its first topic.
    static void Open(const std::string& page = "main.htm") {
        browser->Go(Address(page));
        ASSERT_TRUE(Shows("Welcome to the help"));
        browser->LookAtPage();
    }
    /// Whether the frame comes to show a page whose text holds this.
    static bool Shows(const std::string& text) {
        browser->LookAtPage();
        browser->LookIntoFrame("iframe[name=right]");
        const bool shows = browser->Until(
            "document.readyState=='complete' && document.body.innerText.includes('" + text + "')");
        return shows;
    }
    static bool Until(const std::string& expression) {
        browser->LookAtPage();
        return browser->Until(expression);
    }
    static std::string Link(const std::string& target) { return "#contents a[href=\"" + target + "\"]"; }
    static bool IsCurrent(const std::string& target) {
        return Until("document.querySelector('" + Link(target) +
                     "').getAttribute('aria-current')=='page' && "
                     "document.querySelectorAll('[aria-current]').length==1 && "
                     "document.querySelector('" +
                     Link(target) + "').getClientRects().length==1");
    }
    static bool Focused(const std::string& text) {
        return Until("document.activeElement.textContent.trim()=='" + text + "'");
    }
    static void Search(const std::string& words) {
        browser->LookAtPage();
        browser->Click("#query");
        browser->Run("document.getElementById('query').select()");
        browser->Type(words);
        browser->LookIntoFrame("iframe[name=right]");
    }
    /// The first result's title as the search page comes to show it.
    static bool FirstResult(const std::string& title) {
        browser->LookIntoFrame("iframe[name=right]");
        return browser->Until("document.querySelector('#r .t').textContent=='" + title + "'");
    }

    static std::unique_ptr<SampleHelp> sample;
    static std::unique_ptr<FolderServer> server;
    static std::unique_ptr<Browser> browser;
};

std::unique_ptr<SampleHelp> WebHelpInBrowserTest::sample;
std::unique_ptr<FolderServer> WebHelpInBrowserTest::server;
std::unique_ptr<Browser> WebHelpInBrowserTest::browser;

TEST_P(WebHelpInBrowserTest, TreeOpensClosesAndFollowsThePage) {
    Open();
    EXPECT_TRUE(Until("document.querySelector('" + Link("orchard_Form_Orders.htm") +
                      "').getClientRects().length==0"));
    const std::string twist = "#contents > ul > li .twist";
    browser->Click(twist);
    EXPECT_TRUE(
        Until("document.querySelector('" + Link("Forms.htm") + "').getAttribute('aria-expanded')=='true'"));
    browser->Click(twist);
    EXPECT_TRUE(Until("document.querySelector('" + Link("orchard_Form_Orders.htm") +
                      "').getClientRects().length==0"));
    browser->Click(twist);
    browser->Click(Link("orchard_Form_Orders.htm"));
    EXPECT_TRUE(Shows("How far the order has come"));
    EXPECT_TRUE(IsCurrent("orchard_Form_Orders.htm"));
    EXPECT_TRUE(Until("document.title=='Orders \\u2013 orchard'"));
    // A link in the topic, to a place in the same page, then one to another page.
    browser->LookIntoFrame("iframe[name=right]");
    browser->Click("a[href='#Orders_Status']");
    EXPECT_TRUE(IsCurrent("orchard_Form_Orders.htm#Orders_Status"));
    browser->Click("h1 a");
    EXPECT_TRUE(Shows("Welcome to the help"));
    browser->Click("a[href='Tables.htm']");
    EXPECT_TRUE(IsCurrent("Tables.htm"));
}

TEST_P(WebHelpInBrowserTest, WorksWithTheKeyboardAlone) {
    Open();
    browser->Run("document.activeElement.blur();focus()");
    browser->Type("{Tab}{Tab}{Tab}{Tab}{Tab}{Tab}");
    EXPECT_TRUE(Focused("Forms"));
    browser->Type("{ArrowRight}{ArrowRight}{ArrowDown}");
    EXPECT_TRUE(Focused("Customers"));
    browser->Type("pr");
    EXPECT_TRUE(Focused("Product Details"));
    browser->Type("{Enter}");
    EXPECT_TRUE(IsCurrent("orchard_Form_Product_Details.htm"));
    browser->Type("{ArrowLeft}{ArrowLeft}{ArrowLeft}");
    EXPECT_TRUE(
        Until("document.querySelector('" + Link("Forms.htm") + "').getAttribute('aria-expanded')=='false'"));
    browser->Type("{End}");
    EXPECT_TRUE(Focused("About this help"));
    browser->Type("/order");
    EXPECT_TRUE(Until("document.activeElement.id=='query' && document.activeElement.value=='order'"));
    browser->Type("{ArrowDown}");
    browser->LookIntoFrame("iframe[name=right]");
    EXPECT_TRUE(browser->Until("document.activeElement.className=='t'"));
    browser->Type("{Enter}");
    EXPECT_TRUE(Until("document.querySelector('[aria-current]')!==null && document.title.includes('Order')"));
    browser->LookIntoFrame("iframe[name=right]");
    EXPECT_TRUE(browser->Until("document.querySelector('mark.found')!==null"));
}

TEST_P(WebHelpInBrowserTest, IndexIsFiltered) {
    Open();
    browser->Click("#tabIndex");
    EXPECT_TRUE(Until("document.querySelectorAll('#words [role=option]').length>10"));
    browser->Click("#filter");
    browser->Type("price");
    EXPECT_TRUE(Until(
        "document.querySelectorAll('#words [role=option]').length>1 && "
        "[...document.querySelectorAll('#words [role=option]')].every(o=>/price/i.test(o.textContent))"));
    browser->Run("document.getElementById('filter').select()");
    browser->Type("onpricelist{Enter}");
    EXPECT_TRUE(
        Until("document.querySelector('[aria-current]').href.includes('orchard_Table_Products.htm')"));
    browser->Type("zzz");
    EXPECT_TRUE(Until("document.getElementById('noWords').textContent=='No entry holds this text.'"));
}

TEST_P(WebHelpInBrowserTest, SearchFindsBeginningsMisspellingsAndAccents) {
    Open();
    Search("confirm ord");
    EXPECT_TRUE(FirstResult("Order Confirmation"));
    Search("confrimation");
    EXPECT_TRUE(FirstResult("Confirmation Lines"));
    Search("körbchen");
    EXPECT_TRUE(browser->Until("document.querySelectorAll('#r .t').length==1"));
    const auto title = browser->Run("return document.querySelector('#r .t').textContent");
    Search("KORBCHEN");
    EXPECT_TRUE(FirstResult(title));
    Search("nosuchwordatall");
    EXPECT_TRUE(browser->Until("document.getElementById('n').textContent.startsWith('Nothing found')"));
    Search("orders zzzzzz");
    EXPECT_TRUE(browser->Until(
        "document.getElementById('n').textContent.startsWith('No page holds all the words.')"));
    // A control's name leads to its section, where the words are marked.
    Search("deliver on");
    EXPECT_TRUE(browser->Until("document.querySelector('#r ul mark')!==null"));
    browser->Click("#r a[href='orchard_Form_Orders.htm#Orders_DeliveryDate']");
    EXPECT_TRUE(Shows("How far the order has come"));
    EXPECT_TRUE(browser->Until("document.querySelector('mark.found')!==null"));
    EXPECT_TRUE(IsCurrent("orchard_Form_Orders.htm#Orders_DeliveryDate"));
}

TEST_P(WebHelpInBrowserTest, TopicOpenedByItselfComesIntoTheFrame) {
    browser->Go(Address("orchard_Form_Orders.htm#Orders_Status"));
    EXPECT_TRUE(browser->Until("location.pathname.endsWith('/main.htm')"));
    EXPECT_TRUE(Shows("How far the order has come"));
    EXPECT_TRUE(browser->Until("location.hash=='#Orders_Status'"));
    EXPECT_TRUE(IsCurrent("orchard_Form_Orders.htm#Orders_Status"));
    // Pages of elsewhere aren't shown, whoever asks.
    for (const char* asked : {"?javascript:alert(1)", "?\"http://127.0.0.1:1/x.htm\"", "?../x.htm"})
        Open(std::string("main.htm") + asked);
}

TEST_P(WebHelpInBrowserTest, FitsAPhoneAndADarkScreen) {
    browser->Command("Emulation.setDeviceMetricsOverride",
                     {{"width", 390}, {"height", 800}, {"deviceScaleFactor", 1}, {"mobile", true}});
    browser->Command("Emulation.setTouchEmulationEnabled", {{"enabled", true}, {"maxTouchPoints", 5}});
    browser->Command("Emulation.setEmulatedMedia",
                     {{"features", {{{"name", "prefers-color-scheme"}, {"value", "dark"}}}}});
    Open();
    EXPECT_TRUE(Until("document.documentElement.scrollWidth<=390 && "
                      "document.getElementById('left').getClientRects().length==0"));
    browser->Click("#toggle");
    EXPECT_TRUE(Until("document.getElementById('left').getClientRects().length==1"));
    browser->Click("#contents > ul > li .twist");
    browser->Click(Link("orchard_Form_Orders.htm"));
    EXPECT_TRUE(Shows("How far the order has come"));
    // Wide pictures keep their size, for the areas on them, and scroll by themselves.
    EXPECT_TRUE(browser->Until("innerWidth<=390 && document.documentElement.scrollWidth<=390 && "
                               "[...document.images].some(e=>e.getBoundingClientRect().right>390)"));
    EXPECT_TRUE(browser->Until("getComputedStyle(document.body).backgroundColor=='rgb(20, 24, 29)'"));
    EXPECT_TRUE(Until("document.getElementById('left').getClientRects().length==0 && "
                      "getComputedStyle(document.body).backgroundColor=='rgb(20, 24, 29)'"));
    browser->Click("#toggle");
    browser->Type("{Escape}");
    EXPECT_TRUE(Until(
        "document.getElementById('left').getClientRects().length==0 && document.activeElement.id=='toggle'"));
}

INSTANTIATE_TEST_SUITE_P(All, WebHelpInBrowserTest, ::testing::Values(From::Disk, From::Server),
                         [](const auto& given) { return given.param == From::Disk ? "Disk" : "Server"; });

} // namespace
} // namespace tovimar::test
