// Processor identification and features, filled on first use from the
// platform's system queries and read-only afterwards.
#pragma once

#include <cstddef>
#include <cstdint>

// Platform block of the CPU information record.
struct MacCPUIDStruct {
    uint32_t cpuType;  // always 8
    uint32_t frequency;  // Hz, low 32 bits
    uint32_t stepping;
    uint32_t family;
    uint32_t model;
    uint32_t extModel;
    uint32_t extFamily;
    uint32_t l1InstructionCache;
    uint32_t l2Cache;
    uint32_t logicalProcessors;
    uint32_t physicalProcessors;
    uint8_t hyperthreading, mmx, sse, sse2, sse3, ssse3, sse41, sse42, avx, avx2, fma, floatingPoint;
    char vendor[28];  // the rest of the record
};

struct CPUInfoRecord {
    uint32_t identification[19];  // processor-identification words; zero on this platform
    MacCPUIDStruct mac;
};

static_assert(offsetof(CPUInfoRecord, mac) == 76, "identification block is 19 words");
static_assert(offsetof(MacCPUIDStruct, hyperthreading) == 44, "eleven numbers precede the flags");
static_assert(offsetof(MacCPUIDStruct, vendor) == 56, "twelve flag bytes precede the vendor");
static_assert(sizeof(CPUInfoRecord) == 160, "record size");

class CPUINFO {
public:
    static CPUInfoRecord *GetCPUInfo();
    static CPUInfoRecord *GetWinCPUIDStruct();
    static MacCPUIDStruct *GetMacCPUIDStruct();
    static void SetupCPUID();

    static uint32_t GetNumberofLogicalProcessors();
    static uint32_t GetNumberofPhysicalProcessors();
    static uint32_t GetSteppingInformation();
    static uint32_t GetFamilyInformation();
    static uint32_t GetModelInformation();
    static uint32_t GetExtModelInformation();
    static uint32_t GetExtFamilyInformation();
    static uint32_t GetCPUFrequency();  // MHz, rounded to nearest
    static uint32_t GetCPUType();
    static bool GetCPUVendor();

    static bool MMXAvailable();
    static bool SSEAvailable();
    static bool SSE2Available();
    static bool SSE3Available();
    static bool SSSE3Available();
    static bool SSE4_1Available();
    static bool SSE4_2Available();
    static bool AVXAvailable();
    static bool AVX2Available();
    static bool FMAAvailable();
    static bool SSEFloatAvailable();
    static bool SSEIntegerAvailable();
    static bool HyperthreadingAvailable();
    static bool AltivecAvailable();
    static bool DatastreamsAvailable();
    static bool PowerPCGraphicsInstructionsAvailable();
};

namespace halideqk {
// Test seam: forgets the record so the next query fills it again.
void CpuInfoResetForTesting();
}  // namespace halideqk
