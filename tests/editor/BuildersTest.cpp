#include "editor/CHtmlStringBuilder.h"
#include "editor/CStringBuilder.h"

#include "platform/Error.h"

#include <gtest/gtest.h>

namespace tovimar {
namespace {

TEST(BuildersTest, ABufferCountsCharacters) {
    CStringBuilder builder;
    builder.Append("caf\xC3\xA9 au lait");
    EXPECT_EQ(12U, builder.Length());
    builder.Insert(5, "s");
    builder.InsertByVal(100, "!");
    EXPECT_EQ("caf\xC3\xA9s au lait!", builder.ToString());
    EXPECT_EQ(7U, builder.Find("au"));
    EXPECT_EQ(0U, builder.Find("au", 8));
    builder.Remove(4, 2);
    builder.Remove(12, 9);
    builder.Remove(20, 1);
    EXPECT_EQ("caf au lait", builder.TheString());
    builder.HeapMinimize();
    EXPECT_LE(builder.TheString().size(), builder.Capacity());
    EXPECT_THROW(builder.Insert(0, "x"), RaisedError);
    EXPECT_THROW(builder.Remove(0, 1), RaisedError);
}

TEST(BuildersTest, LinesOfAPage) {
    CHtmlStringBuilder sb;
    sb.Init(10);
    sb.AddString("a", /*vfAddCrLf=*/true);
    sb.AddString("b", /*vfAddCrLf=*/true);
    EXPECT_EQ("a\r\nb", sb.Value());
    EXPECT_EQ(4U, sb.CurrentLen());
    EXPECT_FALSE(sb.LastTokenIsCrLf());
    sb.AddString("\r\n\r\n");
    EXPECT_TRUE(sb.LastTokenIsCrLf());
    sb.RemoveTrailingVbCrLf();
    EXPECT_EQ("a\r\nb", sb.Value());

    const auto formatted = [](std::string text) {
        CHtmlStringBuilder::formatString(text, "..");
        return text;
    };
    EXPECT_EQ("", formatted(""));
    EXPECT_EQ("a\r\n..b", formatted(" a \r\n\r\n \t\r\n  b\r\n"));
    EXPECT_EQ("\r\n..a", formatted("\n  a"));
}

} // namespace
} // namespace tovimar
