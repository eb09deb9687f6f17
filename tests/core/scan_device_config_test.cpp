#include "core/scan_device_config.h"

#include "module/hresult_exception.h"

#include <gtest/gtest.h>

#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>

namespace {

using namespace Norvane::Lumis::Scanning;
namespace fs = std::filesystem;

// A directory of its own for each test, removed afterwards.
class ScanDeviceConfigTest : public ::testing::Test {
  protected:
    void SetUp() override {
        const auto* test = ::testing::UnitTest::GetInstance()->current_test_info();
        directory_ = fs::temp_directory_path() /
                     ("bw_scan_device_config_" + std::to_string(::getpid()) + "_" + test->name());
        fs::remove_all(directory_);
        fs::create_directories(directory_);
    }
    void TearDown() override { fs::remove_all(directory_); }

    void WriteConfig(const std::string& content) const {
        std::ofstream file(directory_ / "ScanDevice.cfg", std::ios::binary);
        file << content;
    }

    ScanDeviceConfig Load() const { return LoadScanDeviceConfigFrom(directory_); }

    fs::path directory_;
};

void ExpectInvalidConfiguration(const std::string& content) {
    SCOPED_TRACE(content);
    std::istringstream input(content);
    try {
        ParseScanDeviceConfig(input);
        ADD_FAILURE() << "accepted";
    } catch (const Norvane::HResultException& error) {
        EXPECT_EQ(error.Error(), E_INVALIDARG);
        EXPECT_EQ(error.Description(), u"Invalid configuration file");
    }
}

ScanDeviceConfig Parse(const std::string& content) {
    std::istringstream input(content);
    return ParseScanDeviceConfig(input);
}

TEST_F(ScanDeviceConfigTest, ValidFileGivesItsThreeValues) {
    WriteConfig("DwellTimeUnit 1e-8\nMaximumDwellTimeFactor 2000\nMaximumDwellTimeResolution 3.2e-6\n");
    EXPECT_EQ(Load(), (ScanDeviceConfig{1e-8, 2000, 3.2e-6}));
}

TEST_F(ScanDeviceConfigTest, AbsentFileLeavesTheDefaults) {
    EXPECT_EQ(Load(), (ScanDeviceConfig{2.5e-8, 4095, 6.4e-6}));
}

TEST_F(ScanDeviceConfigTest, DirectoryInPlaceOfTheFileLeavesTheDefaults) {
    fs::create_directory(directory_ / "ScanDevice.cfg");
    EXPECT_EQ(Load(), ScanDeviceConfig{});
}

TEST_F(ScanDeviceConfigTest, MalformedFileFailsTheLoad) {
    WriteConfig("DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 0\nMaximumDwellTimeResolution 6.4e-6\n");
    try {
        Load();
        FAIL() << "accepted";
    } catch (const Norvane::HResultException& error) {
        EXPECT_EQ(error.Error(), E_INVALIDARG);
        EXPECT_EQ(error.Description(), u"Invalid configuration file");
    }
}

TEST_F(ScanDeviceConfigTest, RunningProgramWithoutAFileGetsTheDefaults) {
    std::error_code error;
    const fs::path executable = fs::read_symlink("/proc/self/exe", error);
    ASSERT_FALSE(error);
    if (fs::exists(executable.parent_path() / "ScanDevice.cfg"))
        GTEST_SKIP() << "a configuration file lies next to the test program";
    EXPECT_EQ(LoadScanDeviceConfig(), ScanDeviceConfig{});
}

TEST(ScanDeviceConfigParseTest, MalformedContentIsRefused) {
    const char* const contents[] = {
        "",
        "MaximumDwellTimeFactor 4095\nDwellTimeUnit 2.5e-8\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 0\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 4095\n",
        "DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 4095\n\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit abc\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 6.4e-6\n",
        "dwelltimeunit 2.5e-8\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit2.5e-8\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnits 2.5e-8\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit 0\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit -2.5e-8\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit 1e99999\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor -1\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 2147483648\nMaximumDwellTimeResolution 6.4e-6\n",
        "DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 0\n",
        "DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 4095\nMaximumDwellTimeResolution 6.4e-6",
    };
    // The last entry is valid (no final line feed is needed) and checks the table's neighbours are not.
    for (std::size_t i = 0; i + 1 < std::size(contents); ++i)
        ExpectInvalidConfiguration(contents[i]);
    EXPECT_EQ(Parse(contents[std::size(contents) - 1]), ScanDeviceConfig{});
}

// The dwell count of a point is 16 bits wide, so a larger factor would let counts wrap.
TEST(ScanDeviceConfigParseTest, FactorMustFitTheSixteenBitDwellCount) {
    EXPECT_EQ(Parse("DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 65535\nMaximumDwellTimeResolution 6.4e-6\n")
                  .maximumDwellTimeFactor,
              65535);
    ExpectInvalidConfiguration(
        "DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 65536\nMaximumDwellTimeResolution 6.4e-6\n");
}

TEST(ScanDeviceConfigParseTest, TextAfterTheNumberAndLinesAfterTheThirdAreIgnored) {
    EXPECT_EQ(
        Parse("DwellTimeUnit 5e-8 s\nMaximumDwellTimeFactor 100 ticks\nMaximumDwellTimeResolution 1e-6 x y\n"
              "anything at all\nDwellTimeUnit -1\n"),
        (ScanDeviceConfig{5e-8, 100, 1e-6}));
}

// The number ends where the stream extraction stops: "4095.9" gives the factor 4095 and ".9" is trailing
// text.
TEST(ScanDeviceConfigParseTest, IntegerFactorStopsAtTheDecimalPoint) {
    EXPECT_EQ(
        Parse("DwellTimeUnit 2.5e-8\nMaximumDwellTimeFactor 4095.9\nMaximumDwellTimeResolution 6.4e-6\n")
            .maximumDwellTimeFactor,
        4095);
}

TEST(ScanDeviceConfigParseTest, CarriageReturnsAndSurroundingBlanksAreWhitespace) {
    EXPECT_EQ(Parse("DwellTimeUnit 2.5e-8\r\n  MaximumDwellTimeFactor\t4095\r\nMaximumDwellTimeResolution "
                    "6.4e-6\r\n"),
              ScanDeviceConfig{});
}

} // namespace
