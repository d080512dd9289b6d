#include "frame/cpuinfo.h"

#include <cstdlib>
#include <cstring>

#include "platform/sysctl.h"

namespace {

constexpr uint32_t kCPUType = 8;
constexpr size_t kMaxVendorBytes = 14;

CPUInfoRecord gRecord;
bool gCreated = false;
bool gFilled = false;

CPUInfoRecord &Record() {
    if (!gCreated) {
        std::memset(&gRecord, 0, sizeof gRecord);
        gCreated = true;
        CPUINFO::SetupCPUID();
    }
    return gRecord;
}

MacCPUIDStruct &Mac() { return Record().mac; }

// Reads a key the two-call way: its size first, then its value into a buffer
// of that size.  A key the system cannot answer reads as zero.
uint32_t QueryNumber(const char *key) {
    size_t size = 0;
    if (qk_platform::sysctlbyname(key, nullptr, &size, nullptr, 0) != 0 || size == 0) return 0;
    void *buffer = std::calloc(1, size < sizeof(uint32_t) ? sizeof(uint32_t) : size);
    if (buffer == nullptr) return 0;
    uint32_t value = 0;
    size_t got = size;
    if (qk_platform::sysctlbyname(key, buffer, &got, nullptr, 0) == 0)
        std::memcpy(&value, buffer, sizeof value);
    std::free(buffer);
    return value;
}

uint8_t QueryFlag(const char *key) {
    size_t size = 0;
    if (qk_platform::sysctlbyname(key, nullptr, &size, nullptr, 0) != 0 || size == 0) return 0;
    auto *buffer = static_cast<uint8_t *>(std::calloc(1, size));
    if (buffer == nullptr) return 0;
    size_t got = size;
    uint8_t value = 0;
    if (qk_platform::sysctlbyname(key, buffer, &got, nullptr, 0) == 0) value = buffer[0] != 0;
    std::free(buffer);
    return value;
}

// The vendor string goes straight into the record, and only when it fits.
void QueryVendor(char *field) {
    size_t size = 0;
    if (qk_platform::sysctlbyname("machdep.cpu.vendor", nullptr, &size, nullptr, 0) != 0) return;
    if (size > kMaxVendorBytes) return;
    size_t got = size;
    qk_platform::sysctlbyname("machdep.cpu.vendor", field, &got, nullptr, 0);
}

}  // namespace

void CPUINFO::SetupCPUID() {
    if (gFilled) return;
    MacCPUIDStruct &m = gRecord.mac;
    m.logicalProcessors = QueryNumber("hw.logicalcpu");
    m.physicalProcessors = QueryNumber("hw.physicalcpu");
    m.frequency = QueryNumber("hw.cpufrequency");
    m.stepping = QueryNumber("machdep.cpu.stepping");
    m.family = QueryNumber("machdep.cpu.family");
    m.extFamily = QueryNumber("machdep.cpu.extfamily");
    m.model = QueryNumber("machdep.cpu.model");
    m.extModel = QueryNumber("machdep.cpu.extmodel");
    QueryVendor(m.vendor);
    m.l1InstructionCache = QueryNumber("hw.l1icachesize");
    m.l2Cache = QueryNumber("hw.l2cachesize");
    m.mmx = QueryFlag("hw.optional.mmx");
    m.sse = QueryFlag("hw.optional.sse");
    m.sse2 = QueryFlag("hw.optional.sse2");
    m.sse3 = QueryFlag("hw.optional.sse3");
    m.ssse3 = QueryFlag("hw.optional.supplementalsse3");
    m.sse41 = QueryFlag("hw.optional.sse4_1");
    m.sse42 = QueryFlag("hw.optional.sse4_2");
    m.avx = QueryFlag("hw.optional.avx1_0");
    m.avx2 = QueryFlag("hw.optional.avx2_0");
    m.floatingPoint = QueryFlag("hw.optional.floatingpoint");
    m.fma = QueryFlag("hw.optional.fma");
    m.hyperthreading = m.logicalProcessors > m.physicalProcessors;
    m.cpuType = kCPUType;
    gFilled = true;
}

void halideqk::CpuInfoResetForTesting() {
    gCreated = false;
    gFilled = false;
}

CPUInfoRecord *CPUINFO::GetCPUInfo() { return &Record(); }
CPUInfoRecord *CPUINFO::GetWinCPUIDStruct() { return &Record(); }
MacCPUIDStruct *CPUINFO::GetMacCPUIDStruct() { return &Mac(); }

uint32_t CPUINFO::GetNumberofLogicalProcessors() { return Mac().logicalProcessors; }
uint32_t CPUINFO::GetNumberofPhysicalProcessors() { return Mac().physicalProcessors; }
uint32_t CPUINFO::GetSteppingInformation() { return Mac().stepping; }
uint32_t CPUINFO::GetFamilyInformation() { return Mac().family; }
uint32_t CPUINFO::GetModelInformation() { return Mac().model; }
uint32_t CPUINFO::GetExtModelInformation() { return Mac().extModel; }
uint32_t CPUINFO::GetExtFamilyInformation() { return Mac().extFamily; }
uint32_t CPUINFO::GetCPUFrequency() { return (Mac().frequency + 500000u) / 1000000u; }
uint32_t CPUINFO::GetCPUType() { return kCPUType; }
bool CPUINFO::GetCPUVendor() { return Mac().cpuType == kCPUType; }

bool CPUINFO::MMXAvailable() { return Mac().mmx; }
bool CPUINFO::SSEAvailable() { return Mac().sse; }
bool CPUINFO::SSE2Available() { return Mac().sse2; }
bool CPUINFO::SSE3Available() { return Mac().sse3; }
bool CPUINFO::SSSE3Available() { return Mac().ssse3; }
bool CPUINFO::SSE4_1Available() { return Mac().sse41; }
bool CPUINFO::SSE4_2Available() { return Mac().sse42; }
bool CPUINFO::AVXAvailable() { return Mac().avx; }
bool CPUINFO::AVX2Available() { return Mac().avx2; }
bool CPUINFO::FMAAvailable() { return Mac().fma; }
bool CPUINFO::SSEFloatAvailable() { return Mac().sse && Mac().family > 5; }
bool CPUINFO::HyperthreadingAvailable() {
    return Mac().logicalProcessors > Mac().physicalProcessors;
}

// Needs processor-identification words, which this platform leaves zero.
bool CPUINFO::SSEIntegerAvailable() {
    const CPUInfoRecord &r = Record();
    if (r.identification[0] < 6) return false;
    if ((r.identification[6] >> 25) & 1u) return true;
    return r.mac.cpuType != kCPUType && ((r.identification[13] >> 22) & 1u) &&
           ((r.identification[13] >> 30) & 1u);
}

bool CPUINFO::AltivecAvailable() { return false; }
bool CPUINFO::DatastreamsAvailable() { return false; }
bool CPUINFO::PowerPCGraphicsInstructionsAvailable() { return false; }
