// Runs the benchmarks, then prints each case's time as a ratio of its baseline: the machine
// is shared and noisy, ratios measured in one run are what can be compared.
#include <benchmark/benchmark.h>

#include <cstdio>
#include <cstring>
#include <map>
#include <string>

#include "platform/headless/headless.h"

namespace bench {
void RegisterBlitBenchmarks();
void RegisterCompositeBenchmarks();
void RegisterGameBenchmarks();
}  // namespace bench

namespace {

class RatioReporter : public benchmark::ConsoleReporter {
public:
    std::map<std::string, double> ns;
    void ReportRuns(const std::vector<Run>& runs) override {
        ConsoleReporter::ReportRuns(runs);
        for (const Run& r : runs) {
            ns[r.benchmark_name()] = r.GetAdjustedRealTime();
        }
    }
};

void PrintRatio(const std::map<std::string, double>& ns, const std::string& name,
                const std::string& base) {
    auto a = ns.find(name);
    auto b = ns.find(base);
    if (a != ns.end() && b != ns.end() && b->second > 0) {
        std::printf("  %-44s %7.2fx %s\n", name.c_str(), a->second / b->second, base.c_str());
    }
}

}  // namespace

int main(int argc, char** argv) {
    bool smoke = false;
    for (int i = 1; i < argc; ++i) {
        if (std::strcmp(argv[i], "--smoke") == 0) {
            smoke = true;
            argv[i] = argv[argc - 1];
            --argc;
            --i;
        }
    }
    bench::RegisterBlitBenchmarks();
    bench::RegisterCompositeBenchmarks();
    bench::RegisterGameBenchmarks();
    benchmark::Initialize(&argc, argv);
    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    if (smoke) {
        return 0;
    }
    std::printf("\nRatios (time of the case / time of the baseline):\n");
    for (const char* size :
         {"3x3", "20x20", "54x30", "55x60", "63x35", "300x30", "300x53", "240x293", "300x293"}) {
        std::string mem = std::string("memcpy_rows/") + size;
        PrintRatio(reporter.ns, std::string("draw_opaque/") + size, mem);
        PrintRatio(reporter.ns, std::string("draw_keyed_ellipse/") + size, mem);
        PrintRatio(reporter.ns, std::string("draw_keyed_random/") + size, mem);
        PrintRatio(reporter.ns, std::string("draw_keyed_ellipse/") + size,
                   std::string("sdl_blit_key_ellipse/") + size);
        PrintRatio(reporter.ns, std::string("draw_keyed_ellipse/") + size,
                   std::string("sdl_blit_key_rle_ellipse/") + size);
        PrintRatio(reporter.ns, std::string("draw_opaque/") + size,
                   std::string("sdl_blit_opaque/") + size);
    }
    PrintRatio(reporter.ns, "composite_frame_draw", "composite_frame_sdl_key");
    PrintRatio(reporter.ns, "composite_frame_draw", "composite_frame_sdl_key_rle");
    return 0;
}
