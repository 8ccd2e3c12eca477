#include "platform/registry/IniRegistry.h"
#include "support/FakeEnvironment.h"

namespace tovimar::platform {
namespace {

class RegistryTest : public test::EnvironmentTest {
protected:
    std::string file = NativeFolder() + "/sub/registry.ini";
};

TEST_F(RegistryTest, KeepsValuesOverASession) {
    const std::string odd = "a=b%41\r\n[x] ; Ё";
    {
        IniRegistry registry(file);
        EXPECT_EQ(registry.Read("HKLM\\Key", ""), "");
        registry.Write("HKLM\\Key", "", "C:\\Program Files\\x");
        registry.Write("HKLM\\Key", "@odd=[name]", odd);
        registry.Write("HKLM\\Key]2", "v", "  blanks  ");
    }
    IniRegistry registry(file);
    EXPECT_EQ(registry.Read("hklm\\KEY", ""), "C:\\Program Files\\x");
    EXPECT_EQ(registry.Read("HKLM\\Key", "@ODD=[NAME]"), odd);
    EXPECT_EQ(registry.Read("HKLM\\Key]2", "V"), "  blanks  ");
    EXPECT_EQ(registry.Read("HKLM\\Key", "none"), "");
}

TEST_F(RegistryTest, ReadsAFileWrittenByHand) {
    WriteFile("sub\\registry.ini",
              "; comment\r\nstray=1\r\n[HKLM\\A]\r\n@=default\r\nnoise\r\nInstallPath=Z:\\x\r\n");
    IniRegistry registry(file);
    EXPECT_EQ(registry.Read("HKLM\\A", ""), "default");
    EXPECT_EQ(registry.Read("HKLM\\A", "installpath"), "Z:\\x");
}

} // namespace
} // namespace tovimar::platform
