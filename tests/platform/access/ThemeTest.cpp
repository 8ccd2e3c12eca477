#include "platform/access/ApplicationModel.h"
#include "platform/access/Fixtures.h"
#include "platform/access/ThemeReader.h"

#include <zlib.h>

namespace tovimar::test {

using namespace platform::access;

namespace {

std::string Number(std::size_t value, int size) {
    std::string bytes;
    for (int i = 0; i < size; ++i, value >>= 8U)
        bytes += static_cast<char>(value & 0xFFU);
    return bytes;
}

std::string Deflated(const std::string& plain) {
    std::string packed(plain.size() + 100, '\0');
    z_stream stream{};
    deflateInit2(&stream, 9, Z_DEFLATED, -MAX_WBITS, 8, Z_DEFAULT_STRATEGY);
    stream.next_in = reinterpret_cast<Bytef*>(const_cast<char*>(plain.data()));
    stream.avail_in = static_cast<uInt>(plain.size());
    stream.next_out = reinterpret_cast<Bytef*>(packed.data());
    stream.avail_out = static_cast<uInt>(packed.size());
    deflate(&stream, Z_FINISH);
    packed.resize(stream.total_out);
    deflateEnd(&stream);
    return packed;
}

/// A zip file of one entry.
std::string Zip(const std::string& name, const std::string& plain, bool deflated) {
    const auto content = deflated ? Deflated(plain) : plain;
    const auto shared = Number(0, 2) + Number(deflated ? 8 : 0, 2) + Number(0, 8) +
                        Number(content.size(), 4) + Number(plain.size(), 4) + Number(name.size(), 2) +
                        Number(0, 2);
    const auto local = "PK\x03\x04" + Number(20, 2) + shared + name + content;
    const auto entry = "PK\x01\x02" + Number(20, 2) + Number(20, 2) + shared + Number(0, 14) + name;
    return local + entry + "PK\x05\x06" + Number(0, 4) + Number(1, 2) + Number(1, 2) +
           Number(entry.size(), 4) + Number(local.size(), 4) + Number(0, 2);
}

std::string ThemeXml() {
    std::string xml = "<a:theme><a:themeElements><a:clrScheme name=\"Own\">"
                      "<a:dk1><a:sysClr val=\"windowText\" lastClr=\"000102\"/></a:dk1>";
    for (const auto* name : {"lt1", "dk2", "lt2", "accent1", "accent2", "accent3", "accent4", "accent5",
                             "accent6", "hlink", "folHlink"})
        xml += std::string("<a:") + name + "><a:srgbClr val=\"F96A1B\"/></a:" + name + ">";
    return xml + "</a:clrScheme></a:themeElements></a:theme>";
}

} // namespace

TEST(Themes, ColoursAreReadAndDamageGivesNone) {
    for (const bool deflated : {false, true}) {
        const auto zip = Zip("theme/theme/theme1.xml", ThemeXml(), deflated);
        const auto colors = ReadThemeColors(zip);
        ASSERT_EQ(colors.size(), 12U);
        EXPECT_EQ(colors[0], 0x000102U);
        EXPECT_EQ(colors[5], 0xF96A1BU);
        for (std::size_t length = 0; length < zip.size(); length += 7)
            EXPECT_TRUE(ReadThemeColors(std::string_view(zip).substr(0, length)).empty()) << length;
        for (std::size_t at = 0; at < zip.size(); at += 3) {
            auto damaged = zip;
            damaged[at] = '\xFF';
            EXPECT_LE(ReadThemeColors(damaged).size(), 12U);
        }
    }
    EXPECT_TRUE(ReadThemeColors(Zip("other.xml", ThemeXml(), false)).empty());
    EXPECT_TRUE(ReadThemeColors(Zip("theme/theme/theme1.xml", "<a:theme/>", true)).empty());
}

using ThemedApplicationTest = ApplicationTest;

TEST_F(ThemedApplicationTest, ThePropertiesNameTheTheme) {
    Part("forms\\Main.bas", SmallForm(""));
    Part("themes\\Own.thmx", Zip("theme/theme/theme1.xml", ThemeXml(), true));
    EXPECT_EQ(ApplicationModel(NativeApplication()).ThemeColors().at(4), 0x4F81BDU) << "no property names it";
    Part("dbs-properties.json", R"({"Items": {"Theme Resource Name": {"Value": "Own"}}})");
    EXPECT_EQ(ApplicationModel(NativeApplication()).ThemeColors().at(4), 0xF96A1BU);
    Part("dbs-properties.json", R"({"Items": {"Theme Resource Name": {"Value": "..\\forms\\Main"}}})");
    EXPECT_EQ(ApplicationModel(NativeApplication()).ThemeColors().at(4), 0x4F81BDU);
    Part("dbs-properties.json", "{");
    EXPECT_EQ(ApplicationModel(NativeApplication()).ThemeColors().at(4), 0x4F81BDU);
}

} // namespace tovimar::test
