// The reference host: loads the plug-in as the editor does, runs start-up,
// then checks and times every routine it installed.
//
//   halideqk_host [summary|verify|bench|all] [--quick] [--plugin PATH]
#include <cstring>
#include <string>

#include "host/commands.h"

int main(int argc, char **argv) {
    std::string command = "all", path = host::DefaultPluginPath();
    bool quick = false;
    for (int i = 1; i < argc; ++i) {
        if (std::strcmp(argv[i], "--quick") == 0) {
            quick = true;
        } else if (std::strcmp(argv[i], "--plugin") == 0 && i + 1 < argc) {
            path = argv[++i];
        } else {
            command = argv[i];
        }
    }
    if (command != "all" && command != "summary" && command != "verify" && command != "bench") {
        std::fprintf(stderr, "usage: %s [summary|verify|bench|all] [--quick] [--plugin PATH]\n", argv[0]);
        return 2;
    }

    host::Plugin plugin(path);
    host::HostRecord record;
    std::printf("== start-up (%s)\n", path.c_str());
    if (!host::StartupSummary(plugin, record, stdout)) return 1;
    record.announceNoise();

    int failures = 0;
    if (command == "all" || command == "verify") {
        std::printf("\n== verify\n");
        failures = host::Verify(plugin, record, stdout);
    }
    if (command == "all" || command == "bench") {
        std::printf("\n== speed\n");
        host::SpeedTable(plugin, stdout, quick);
    }
    return failures == 0 ? 0 : 1;
}
