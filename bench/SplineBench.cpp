// Contour geometry on lines of realistic size: the preview runs on every mouse move, the
// conversions once per contour line. "allocs" counts heap allocations per call (0 once warm is the
// goal).
#include <benchmark/benchmark.h>

#include <atomic>
#include <cmath>
#include <cstdlib>
#include <new>

#include "geometry/ContourConversion.h"
#include "geometry/Primitives.h"

namespace {

std::atomic<long> g_allocations{0};

// A gently winding contour line of `count` points spanning about `span` metres in x, with a swing
// of a fiftieth of the span in y and some jitter between neighbours, as clicked by hand.
CPolyline2D MakeContour(int count, double span) {
    CPolyline2D line;
    const double step = span / count;
    for (int i = 0; i < count; ++i) {
        const double x = i * step;
        const double y = 0.02 * span * std::sin(i * 6.0 / count) + 0.2 * step * std::cos(i * 1.7);
        line.Add({Round5(x), Round5(y)});
    }
    return line;
}

void Preview(benchmark::State& state, int count, double span) {
    const CPolyline2D line = MakeContour(count, span);
    const auto cursorX = float(span + 3.3);
    const auto cursorY = float(span * 0.01);
    CPolyline2D out;
    line.SplinePreview(1.0, out, cursorX, cursorY);  // warm up the working sets
    const long before = g_allocations.load();
    for (auto _ : state) {
        line.SplinePreview(1.0, out, cursorX, cursorY);
        benchmark::DoNotOptimize(out.GetCount());
    }
    state.counters["allocs"] = benchmark::Counter(double(g_allocations.load() - before),
                                                  benchmark::Counter::kAvgIterations);
    state.counters["points"] = double(out.GetCount());
}

void BM_SplinePreview_50pts_200m(benchmark::State& state) {
    Preview(state, 50, 200.0);
}
void BM_SplinePreview_1000pts_5km(benchmark::State& state) {
    Preview(state, 1000, 5000.0);
}

void BM_SplineInterpolate_1000pts_5km(benchmark::State& state) {
    const CPolyline2D line = MakeContour(1000, 5000.0);
    CPolyline2D out;
    for (auto _ : state) {
        line.SplineInterpolate(1.0, out);
        benchmark::DoNotOptimize(out.GetCount());
    }
    state.counters["points"] = double(out.GetCount());
}

void BM_LinearInterpolate_1000pts_5km(benchmark::State& state) {
    const CPolyline2D line = MakeContour(1000, 5000.0);
    CPolyline2D out;
    for (auto _ : state) {
        line.LinearInterpolate(1.0, out);
        benchmark::DoNotOptimize(out.GetCount());
    }
    state.counters["points"] = double(out.GetCount());
}

BENCHMARK(BM_SplinePreview_50pts_200m)->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_SplinePreview_1000pts_5km)->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_SplineInterpolate_1000pts_5km)->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_LinearInterpolate_1000pts_5km)->Unit(benchmark::kMicrosecond);

}  // namespace

// Counting replacements of the global allocation functions (the sized and aligned forms forward
// here).
#pragma GCC diagnostic ignored "-Wmismatched-new-delete"
void* operator new(std::size_t size) {
    g_allocations.fetch_add(1, std::memory_order_relaxed);
    if (void* p = std::malloc(size ? size : 1)) {
        return p;
    }
    throw std::bad_alloc();
}
void operator delete(void* p) noexcept {
    std::free(p);
}
void operator delete(void* p, std::size_t) noexcept {
    std::free(p);
}

BENCHMARK_MAIN();
