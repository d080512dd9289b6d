// CPU information: lazily filled from the system queries, with the rules for
// frequency rounding, the vendor string and the derived answers.
#include <gtest/gtest.h>

#include <set>
#include <string>
#include <fstream>

#include "frame/cpuinfo.h"
#include "platform/sysctl.h"
#include "tests/fake_sysctl.h"

namespace {

TEST(CpuInfo, ThisMachineAnswersFromCpuidAndTopology) {
    halideqk::CpuInfoResetForTesting();
    // The build machines have both instruction sets the plug-in targets.
    EXPECT_TRUE(CPUINFO::SSE2Available());
    EXPECT_TRUE(CPUINFO::SSE4_1Available());
    EXPECT_TRUE(CPUINFO::AVX2Available());
    EXPECT_TRUE(CPUINFO::FMAAvailable());
    const uint32_t logical = CPUINFO::GetNumberofLogicalProcessors();
    const uint32_t physical = CPUINFO::GetNumberofPhysicalProcessors();
    EXPECT_GE(physical, 1u);
    EXPECT_GE(logical, physical);

    // Physical cores are the distinct (package, core) pairs the kernel reports.
    std::set<std::pair<long, long>> cores;
    for (uint32_t cpu = 0; cpu < logical; ++cpu) {
        const std::string base = "/sys/devices/system/cpu/cpu" + std::to_string(cpu) + "/topology/";
        long package = -1, core = -1;
        std::ifstream(base + "physical_package_id") >> package;
        std::ifstream(base + "core_id") >> core;
        if (package >= 0 && core >= 0) cores.insert({package, core});
    }
    if (!cores.empty()) {
        EXPECT_EQ(physical, cores.size());
    }

    const std::string vendor = CPUINFO::GetMacCPUIDStruct()->vendor;
    EXPECT_TRUE(vendor == "GenuineIntel" || vendor == "AuthenticAMD") << vendor;
    EXPECT_EQ(CPUINFO::GetCPUType(), 8u);
    EXPECT_TRUE(CPUINFO::GetCPUVendor());
}

TEST(CpuInfo, UnknownKeysAnswerEnoent) {
    size_t size = 0;
    EXPECT_EQ(qk_platform::sysctlbyname("hw.nonsense", nullptr, &size, nullptr, 0), -1);
    EXPECT_EQ(errno, ENOENT);
    uint32_t v = 0;
    size = sizeof v;
    EXPECT_EQ(qk_platform::sysctlbyname("hw.logicalcpu", &v, &size, nullptr, 0), 0);
    EXPECT_GE(v, 1u);
}

TEST(CpuInfo, HyperthreadingComparesTheCounts) {
    FakeSysctl fake;
    fake.SetProcessors(8, 4);
    EXPECT_TRUE(CPUINFO::HyperthreadingAvailable());
    EXPECT_EQ(CPUINFO::GetMacCPUIDStruct()->hyperthreading, 1);
    CPUINFO::GetMacCPUIDStruct()->physicalProcessors = 8;  // compared on each call
    EXPECT_FALSE(CPUINFO::HyperthreadingAvailable());
}

TEST(CpuInfo, FrequencyRoundsToTheNearestMegahertz) {
    FakeSysctl fake;
    fake.SetU64("hw.cpufrequency", 2299999999ull);
    EXPECT_EQ(CPUINFO::GetCPUFrequency(), 2300u);
    halideqk::CpuInfoResetForTesting();
    fake.SetU64("hw.cpufrequency", 2300499999ull);
    EXPECT_EQ(CPUINFO::GetCPUFrequency(), 2300u);
}

TEST(CpuInfo, VendorIsReadOnlyWhenItFitsFourteenBytes) {
    FakeSysctl fake;
    fake.SetString("machdep.cpu.vendor", "ThirteenChars");  // 14 bytes with its NUL
    EXPECT_STREQ(CPUINFO::GetMacCPUIDStruct()->vendor, "ThirteenChars");
    halideqk::CpuInfoResetForTesting();
    fake.SetString("machdep.cpu.vendor", "FourteenChars!");  // 15 bytes
    const char *field = CPUINFO::GetMacCPUIDStruct()->vendor;
    for (int i = 0; i < 28; ++i) EXPECT_EQ(field[i], 0) << i;
}

TEST(CpuInfo, MissingKeysReadAsZeroAndTheRecordFillsOnce) {
    FakeSysctl fake;  // only the processor counts are known
    EXPECT_FALSE(CPUINFO::SSE2Available());
    EXPECT_EQ(CPUINFO::GetFamilyInformation(), 0u);
    EXPECT_EQ(CPUINFO::GetCPUFrequency(), 0u);
    EXPECT_EQ(CPUINFO::GetNumberofLogicalProcessors(), 2u);
    CPUINFO::AVX2Available();
    CPUINFO::SetupCPUID();
    EXPECT_EQ(fake.queries("hw.optional.avx2_0"), 1) << "a missing key is asked once, for its size";
    EXPECT_EQ(fake.queries("hw.logicalcpu"), 2) << "size, then value";
}

TEST(CpuInfo, FlagsTakeTheFirstByteOfWiderValues) {
    FakeSysctl fake;
    fake.SetBytes("hw.optional.avx2_0", {0, 1, 0, 0});
    fake.SetBytes("hw.optional.fma", {2, 0, 0, 0, 0, 0, 0, 0});
    EXPECT_FALSE(CPUINFO::AVX2Available());
    EXPECT_TRUE(CPUINFO::FMAAvailable());
}

TEST(CpuInfo, DerivedAnswers) {
    FakeSysctl fake;
    fake.SetFeatures({"sse"});
    fake.SetInt("machdep.cpu.family", 5);
    EXPECT_FALSE(CPUINFO::SSEFloatAvailable());
    halideqk::CpuInfoResetForTesting();
    fake.SetInt("machdep.cpu.family", 6);
    EXPECT_TRUE(CPUINFO::SSEFloatAvailable());
    EXPECT_FALSE(CPUINFO::SSEIntegerAvailable()) << "no identification words on this platform";
    CPUINFO::GetWinCPUIDStruct()->identification[0] = 6;
    CPUINFO::GetWinCPUIDStruct()->identification[6] = 1u << 25;
    EXPECT_TRUE(CPUINFO::SSEIntegerAvailable());
    EXPECT_FALSE(CPUINFO::AltivecAvailable());
    EXPECT_FALSE(CPUINFO::DatastreamsAvailable());
    EXPECT_FALSE(CPUINFO::PowerPCGraphicsInstructionsAvailable());
    EXPECT_EQ(static_cast<void *>(CPUINFO::GetMacCPUIDStruct()),
              static_cast<void *>(&CPUINFO::GetCPUInfo()->mac));
}

}  // namespace
