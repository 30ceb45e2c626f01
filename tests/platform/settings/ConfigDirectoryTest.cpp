#include <gtest/gtest.h>

#include "../../support/TestSupport.h"
#include "platform/settings/ConfigDirectory.h"

using nedit::test::ScopedEnv;

TEST(ConfigDirectory, OurVariableThenXdgThenHome) {
    ScopedEnv home("HOME", "/home/surveyor");
    {
        ScopedEnv config("SXNEDIT_CONFIG", "/tmp/cfg");
        ScopedEnv xdg("XDG_CONFIG_HOME", "/xdg");
        EXPECT_EQ(nedit::ConfigDirectory(), "/tmp/cfg");
        EXPECT_EQ(nedit::ConfigFile("NEDIT.INI"), "/tmp/cfg/NEDIT.INI");
    }
    {
        // An empty variable is as good as none.
        ScopedEnv config("SXNEDIT_CONFIG", "");
        ScopedEnv xdg("XDG_CONFIG_HOME", "/xdg");
        EXPECT_EQ(nedit::ConfigDirectory(), "/xdg/sxnedit");
    }
    {
        ScopedEnv config("SXNEDIT_CONFIG", std::nullopt);
        ScopedEnv xdg("XDG_CONFIG_HOME", std::nullopt);
        EXPECT_EQ(nedit::ConfigFile("SurveyCodes.csv"),
                  "/home/surveyor/.config/sxnedit/SurveyCodes.csv");
    }
}
