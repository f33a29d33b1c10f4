// The reference host's side of an import placement: per survey point one height point, and one
// placed object from a template per point code, made through the host's interfaces as the plug-in
// makes them. The whole must grow linearly with the number of points.
#include <benchmark/benchmark.h>

#include <cstdio>
#include <fstream>
#include <string>
#include <vector>

#include "host/ModelObjects.h"
#include "host/Session.h"

namespace {

constexpr int kCodes = 1000;

// One object file per code in the temporary folder, written once.
const std::vector<COleString>& ObjectFiles() {
    static const std::vector<COleString> files = [] {
        std::vector<COleString> names;
        const std::string folder = "/tmp/osrik_bench_";
        for (int i = 0; i < kCodes; ++i) {
            const std::string path = folder + std::to_string(i) + ".oqb";
            std::ofstream(path) << "osrik-object 1\nname Objekt " << i << "\nextents 1 1 2\n";
            names.push_back(Utf8ToUtf16(path));
        }
        return names;
    }();
    return files;
}

VARIANT Matrix(float fX, float fY, float fZ) {
    SAFEARRAYBOUND bounds[2] = {{4, 0}, {4, 0}};
    VARIANT v;
    VariantInit(&v);
    v.vt = VT_ARRAY | VT_R4;
    v.parray = SafeArrayCreate(VT_R4, 2, bounds);
    void* pData = nullptr;
    SafeArrayAccessData(v.parray, &pData);
    float* pf = static_cast<float*>(pData);
    const float values[16] = {1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1, 0, fX, fY, fZ, 1};
    std::copy(values, values + 16, pf);
    SafeArrayUnaccessData(v.parray);
    return v;
}

void PlaceObjects(COsrikApplication& app, int nPoints) {
    const int nPerCode = nPoints / kCodes;
    for (int code = 0; code < kCodes; ++code) {
        BSTR bstrFile = SysAllocString(ObjectFiles()[size_t(code)].c_str());
        IOsrikObjectTemplate* pTemplate = nullptr;
        app.LoadObjectFile(bstrFile, 1, &pTemplate);
        SysFreeString(bstrFile);
        for (int i = 0; i < nPerCode && pTemplate; ++i) {
            IOsrikObject3D* pObject = nullptr;
            pTemplate->CreateObjectInstance(0, 0, &pObject);
            pObject->SetObjectMode(49);
            pObject->SetObjectLevel(-1);
            float fX = 0, fY = 0, fZ = 0;
            pObject->GetObjectExtents(0, &fX, &fY, &fZ);
            VARIANT matrix = Matrix(float(i), float(code), 100 + fZ * 0.5f);
            LONG lResult = 0;
            pObject->SetTransformMatrix(matrix, &lResult);
            VariantClear(&matrix);
            pObject->InsertObject(0, &lResult);
            pObject->Release();
        }
        if (pTemplate) {
            pTemplate->Release();
        }
    }
}

void BM_HostPlacement(benchmark::State& state) {
    const int nPoints = int(state.range(0));
    ObjectFiles();
    for (auto _ : state) {
        CHostSession session("/tmp/", false);
        COsrikApplication& app = session.App();
        LONG lGroup = 0, lResult = 0;
        BSTR bstrName = SysAllocString(Utf8ToUtf16("Geometerdatei importieren").c_str());
        app.BeginEditGroup(bstrName, &lGroup);
        SysFreeString(bstrName);
        app.ActivateEditGroup(&lGroup, &lResult);
        for (int i = 0; i < nPoints; ++i) {
            app.SetProgressPosition(LONG(float(i) / float(nPoints) * 100));
            app.CreateHeightPoint(float(i % 1000), float(i / 1000), 100, &lResult);
        }
        PlaceObjects(app, nPoints);
        app.EndEditGroup(&lGroup, -1, &lResult);
        benchmark::DoNotOptimize(session.State().project.objects.size());
    }
    state.SetItemsProcessed(state.iterations() * nPoints);
    state.SetComplexityN(nPoints);
}
BENCHMARK(BM_HostPlacement)
    ->Arg(10000)
    ->Arg(100000)
    ->Unit(benchmark::kMillisecond)
    ->Complexity(benchmark::oN);

}  // namespace

BENCHMARK_MAIN();
