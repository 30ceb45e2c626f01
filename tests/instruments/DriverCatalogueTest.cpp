// Finding, trying and loading driver plug-ins: faulty libraries are refused by name, each
// for its own reason, and the good ones beside them still load.

#include <gtest/gtest.h>
#include <unistd.h>

#include "../support/HeadlessDialogHost.h"
#include "../support/TestSupport.h"
#include "instruments/DriverCatalogue.h"
#include "instruments/UDeviceManager.h"
#include "platform/plugins/PluginProbe.h"

namespace {

const std::string kDrivers = SXNEDIT_TEST_DRIVER_DIR;
const std::string kBadDrivers = SXNEDIT_TEST_BAD_DRIVER_DIR;

// A driver directory with the build's two drivers, a second copy of one of them, the faulty
// drivers and a file that only looks like a library.
class DriverDirectory : public ::testing::Test {
  protected:
    void SetUp() override {
        Link(kDrivers + "/gsi.so", "gsi.so");
        Link(kDrivers + "/gsi.so", "gsi_copy.so");
        Link(kDrivers + "/neutral.so", "neutral.so");
        for (const char* bad : {"missing_symbol.so", "wrong_version.so", "crash_on_load.so"})
            Link(kBadDrivers + "/" + bad, bad);
        dir.Write("not_a_library.so", "this is text\n");
        dir.Write("readme.txt", "not a driver at all\n");
    }
    void Link(const std::string& target, const std::string& name) {
        ASSERT_EQ(symlink(target.c_str(), dir.File(name).c_str()), 0);
    }

    nedit::test::TempDir dir;
};

TEST_F(DriverDirectory, FaultyLibrariesAreRefusedByNameAndTheOthersStillLoad) {
    const nedit::DriverCatalogue catalogue(dir.Path());
    ASSERT_EQ(catalogue.Drivers().size(), 2u);
    EXPECT_EQ(catalogue.Drivers()[0].name, L"Leica GSI");
    EXPECT_EQ(catalogue.Drivers()[0].extensions, L"gsi,gs8,gs16");
    EXPECT_EQ(catalogue.Drivers()[1].name, L"Neutral");
    EXPECT_EQ(catalogue.Drivers()[1].path, dir.File("neutral.so"));

    std::map<std::string, std::string> refused;
    for (const nedit::RefusedDriver& driver : catalogue.Refused())
        refused[driver.file] = driver.reason;
    ASSERT_EQ(refused.size(), 5u);
    EXPECT_EQ(refused["missing_symbol.so"], "it lacks the function sxn_driver_translate");
    EXPECT_EQ(refused["wrong_version.so"],
              "it was built for version 3 of the driver interface; this program takes versions 1 "
              "to 2");
    EXPECT_EQ(refused["crash_on_load.so"].substr(0, 35), "it crashed while loading (signal 11");
    EXPECT_EQ(refused["gsi_copy.so"],
              "a driver of the same name, Leica GSI, was taken from gsi.so");
    EXPECT_NE(refused["not_a_library.so"].find("not_a_library.so"), std::string::npos);
}

TEST_F(DriverDirectory, TheManagerOffersTheGoodDriversAndLoadsThemByName) {
    UDeviceManager manager(L"code control", 0, false, dir.Path());
    nedit::HeadlessDialogHost host;
    manager.SetDialogHost(&host);
    std::vector<std::wstring> names;
    EXPECT_EQ(manager.GetNameList(names), 2);
    EXPECT_EQ(names, (std::vector<std::wstring>{L"Leica GSI", L"Neutral"}));
    EXPECT_EQ(manager.GetRefusedDrivers().size(), 5u);
    EXPECT_EQ(manager.GetDeviceDescription(L"Neutral"),
              L"Neutral records (#VERSION-1.0 NEUTRAL FILE), from a file or an instrument");
    EXPECT_EQ(manager.GetFileExtension(L"Unknown"), L"");

    EXPECT_EQ(manager.LoadDLL(L"leica gsi"), 1);
    EXPECT_EQ(manager.GetLoadedName(), L"Leica GSI");
    EXPECT_EQ(manager.LoadDLL(L"Faulty"), 0);
    EXPECT_EQ(manager.GetLastError(), L"There is no driver for Faulty.");
    EXPECT_EQ(manager.GetLoadedName(), L"");

    manager.ShowDeviceDetails(L"Neutral");
    ASSERT_EQ(host.Messages().size(), 1u);
    EXPECT_NE(host.Messages()[0].text.find(L"Raw file extensions: neu"), std::wstring::npos);
    EXPECT_EQ(manager.GetProfileText(), L"code control");

    // A transfer that never started, a port never opened, a driver never loaded: ending
    // them all, twice, does no harm.
    for (int i = 0; i < 2; ++i) {
        manager.Abort();
        EXPECT_EQ(manager.ClosePort(), 1);
        EXPECT_EQ(manager.DeleteDLL(), 1);
    }
    EXPECT_EQ(manager.GetEOF(), 1);
    EXPECT_EQ(manager.SetTranslateMode(), 0);
}

TEST_F(DriverDirectory, ADriverOfTheFirstVersionStillLoadsAndOnlyUploadersUpload) {
    Link(kBadDrivers + "/version_one.so", "version_one.so");
    const nedit::DriverCatalogue catalogue(dir.Path());
    ASSERT_EQ(catalogue.Drivers().size(), 3u);
    EXPECT_TRUE(catalogue.Drivers()[0].uploads);  // Leica GSI
    EXPECT_TRUE(catalogue.Drivers()[1].uploads);  // Neutral
    EXPECT_EQ(catalogue.Drivers()[2].name, L"Version One");
    EXPECT_FALSE(catalogue.Drivers()[2].uploads);

    UDeviceManager manager(L"", 0, false, dir.Path());
    ASSERT_EQ(manager.LoadDLL(L"Version One"), 1);
    EXPECT_FALSE(manager.CanUpload());
    EXPECT_EQ(manager.StartUpload(SXN_MODE_METRES), 0);
    EXPECT_EQ(manager.GetLastError(), L"The driver Version One cannot upload points.");
}

TEST(DriverCatalogue, AMissingDirectoryHoldsNoDrivers) {
    const nedit::DriverCatalogue catalogue("/nonexistent/drivers");
    EXPECT_TRUE(catalogue.Drivers().empty());
    EXPECT_TRUE(catalogue.Refused().empty());
}

TEST(DriverCatalogue, TheDirectoryComesFromTheEnvironmentOrLiesBesideTheProgram) {
    {
        nedit::test::ScopedEnv env("SXNEDIT_DRIVER_DIR", std::string("/opt/drivers"));
        EXPECT_EQ(nedit::DriverCatalogue::DefaultDirectory(), "/opt/drivers");
    }
    nedit::test::ScopedEnv env("SXNEDIT_DRIVER_DIR", std::nullopt);
    const std::string directory = nedit::DriverCatalogue::DefaultDirectory();
    EXPECT_EQ(directory.substr(directory.size() - 14), "/tests/drivers");
}

TEST(PluginProbe, ALibraryThatHangsWhileLoadingIsKilledWhenItsTimeIsUp) {
    const auto started = std::chrono::steady_clock::now();
    const nedit::ProbeResult result = nedit::ProbePlugin(
        kBadDrivers + "/hang_on_load.so",
        [](const nedit::PluginLibrary&, std::string&, std::string&) { return true; },
        std::chrono::milliseconds(300));
    EXPECT_FALSE(result.ok);
    EXPECT_EQ(result.error, "it did not finish loading within 300 ms");
    EXPECT_LT(std::chrono::steady_clock::now() - started, std::chrono::seconds(5));
}

}  // namespace
