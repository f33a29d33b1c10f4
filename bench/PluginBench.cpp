// The plug-in's own work against the reference host's objects, in process: inserting an imported
// point set with its objects (must grow linearly with the points), and one mouse move of the spline
// preview of a long contour line.
#include <benchmark/benchmark.h>

#include <cmath>
#include <fstream>
#include <memory>
#include <string>

#include "core/KalmoretImpl.h"
#include "framework/WinApp.h"
#include "geometry/Primitives.h"
#include "host/Session.h"
#include "platform/HostDriver.h"

namespace {

constexpr int kCodes = 1000;

// One object file per code, written once into the temporary folder.
std::string ObjectFile(int nCode) {
    static const bool written = [] {
        for (int i = 0; i < kCodes; ++i) {
            std::ofstream("/tmp/kalmoret_bench_" + std::to_string(i) + ".oqb")
                << "osrik-object 1\nname Objekt " << i << "\nextents 1 1 2\n";
        }
        return true;
    }();
    (void)written;
    return "/tmp/kalmoret_bench_" + std::to_string(nCode) + ".oqb";
}

// The automation object connected to a fresh reference host; every question is answered OK.
struct CConnectedPlugin {
    CHostSession session{"/tmp/", false};
    CKalmoretImpl* pImpl = new CKalmoretImpl;

    CConnectedPlugin() {
        // The benchmark executable carries the plug-in's resources; there is no application object.
        AfxModuleAttach(GetModuleHandleA(nullptr));
        DriverSetMessageBoxProc([](void*, LPCSTR, LPCSTR, UINT) { return IDOK; }, nullptr);
        pImpl->Connect(&session.App());
    }
    ~CConnectedPlugin() {
        pImpl->Disconnect();
        pImpl->Release();
        DriverSetMessageBoxProc(nullptr, nullptr);
    }
};

void FillPointSet(CSurveyPointSet& set, int nPoints) {
    for (int i = 0; i < nPoints; ++i) {
        CSurveyPoint p;
        p.m_fX = float(i % 1000);
        p.m_fY = float(i / 1000);
        p.m_fZ = 100.0f + float(i % 7);
        p.m_Assignment.m_strObjectId.Format("C%d", i % kCodes);
        p.m_Assignment.m_strObjectFile = ObjectFile(i % kCodes).c_str();
        set.Add(p);
    }
    set.SetCreationMode(1);
    set.UpdateRange();
}

// One click with the import entry: the question, the plot, a height point and an object per point.
void BM_InsertPointSet(benchmark::State& state) {
    const int nPoints = int(state.range(0));
    for (auto _ : state) {
        state.PauseTiming();
        auto plugin = std::make_unique<CConnectedPlugin>();
        FillPointSet(plugin->pImpl->m_PointSet, nPoints);
        plugin->pImpl->m_nMode = kModePlacementPending;
        state.ResumeTiming();
        plugin->pImpl->OnHowInput(plugin->pImpl->m_lImportEntry, 5000, 5000, 0);
        state.PauseTiming();
        const CProject& project = plugin->session.State().project;
        state.counters["height_points"] = double(project.heightPoints.size());
        state.counters["objects"] = double(project.objects.size());
        plugin.reset();
        state.ResumeTiming();
    }
    state.counters["per_point"] =
        benchmark::Counter(double(nPoints), benchmark::Counter::kIsIterationInvariantRate |
                                                benchmark::Counter::kInvert);
}

// A spline contour of 1,000 points over about 5 km; every call redraws its preview.
void BM_HowMoveSplinePreview(benchmark::State& state) {
    CConnectedPlugin plugin;
    CKalmoretImpl& impl = *plugin.pImpl;
    for (int i = 0; i < 1000; ++i) {
        const double x = i * 5.0;
        impl.m_Contour.Add({Round5(x), Round5(100.0 * std::sin(i * 0.006) + std::cos(i * 1.7))});
    }
    impl.m_nInterpol = 2;
    impl.m_fSegLen = 1.0f;
    float fX = 5003.3f;
    for (auto _ : state) {
        impl.OnHowMove(impl.m_lPolylineEntry, fX, 50.0f);
        fX += 0.001f;
    }
}

BENCHMARK(BM_InsertPointSet)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_HowMoveSplinePreview)->Unit(benchmark::kMicrosecond);

}  // namespace

BENCHMARK_MAIN();
