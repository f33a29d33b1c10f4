// Reading surveyor files: CSurveyPointSet::ReadFile against a naive line-by-line reader (fgets and
// strtod, as the reading rules read literally) on generated files of 100,000 and 1,000,000 point
// lines. Counters: ns per line (flat when the reading is linear), and heap bytes per point, the
// peak during a read and what the set keeps afterwards (goal: at most 128).
#include <benchmark/benchmark.h>
#include <malloc.h>

#include <algorithm>
#include <atomic>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <new>
#include <string>

#include "import/SurveyPointSet.h"

namespace {

std::atomic<int64_t> g_nLiveBytes{0};
std::atomic<int64_t> g_nPeakBytes{0};

std::string BenchFile(long nLines) {
    return (std::filesystem::temp_directory_path() /
            ("kalmoret_survey_bench_" + std::to_string(nLines) + ".txt"))
        .string();
}

// Lines like "P123 3512345.123 5801234.567 123.456 Baum", values varying from line to line.
void WriteBenchFile(long nLines) {
    std::FILE* pFile = std::fopen(BenchFile(nLines).c_str(), "wb");
    if (pFile == nullptr) {
        std::perror("bench file");
        std::exit(1);
    }
    const char* const codes[] = {"Baum", "Mast", "Schacht", "Kante", "Haus"};
    for (long i = 0; i < nLines; ++i) {
        std::fprintf(pFile, "P%ld %ld.%03ld %ld.%03ld %ld.%03ld %s\n", i + 1, 3512000 + i % 997,
                     (i * 7) % 1000, 5801000 + i % 991, (i * 13) % 1000, 100 + i % 83,
                     (i * 31) % 1000, codes[i % 5]);
    }
    std::fclose(pFile);
}

// The reading rules taken literally: fgets into a 255-byte buffer, white space trimmed, tokens
// copied out, strtod with an end check for every numeric column.
bool NaiveNumber(const std::string& token, float& fValue) {
    char* pEnd = nullptr;
    const double d = std::strtod(token.c_str(), &pEnd);
    if (token.empty() || *pEnd != '\0') {
        return false;
    }
    fValue = std::abs(d) > 3.4e38 ? 0.0f : float(d);
    return true;
}

bool NaiveParse(const char* pszLine, int nRunning, CSurveyPoint& point) {
    std::string line(pszLine);
    const char* ws = " \t\r\n\v\f";
    line.erase(0, line.find_first_not_of(ws));
    line.erase(line.find_last_not_of(ws) + 1);
    std::string tokens[5];
    int n = 0;
    size_t i = line.find_first_not_of(" \t");
    while (i != std::string::npos && n < 5) {
        const size_t e = n == 4 ? line.size() : std::min(line.find_first_of(" \t", i), line.size());
        tokens[n++] = line.substr(i, e - i);
        i = line.find_first_not_of(" \t", e);
    }
    float v[5];
    auto num = [&](int k) { return NaiveNumber(tokens[k], v[k]); };
    int first = 0;  // first coordinate token
    if (n == 3 && num(0) && num(1) && num(2)) {
    } else if (n == 4 && num(3)) {
        if (!num(1) || !num(2)) {
            return false;
        }
        first = 1;
    } else if (n == 4 && num(0) && num(1) && num(2)) {
    } else if (n == 5 && num(1) && num(2) && num(3)) {
        first = 1;
    } else {
        return false;
    }
    point.m_strName = first == 1 ? CString(tokens[0].c_str()) : CString(std::to_string(nRunning));
    point.m_fX = v[first];
    point.m_fY = v[first + 1];
    point.m_fZ = v[first + 2];
    const bool bCode = n == 5 || (n == 4 && first == 0);
    point.m_Assignment.m_strObjectId = bCode ? tokens[n - 1].c_str() : "";
    return true;
}

bool NaiveRead(const char* pszPath, CSurveyPointSet& set) {
    set = CSurveyPointSet();
    std::FILE* pFile = std::fopen(pszPath, "r");
    if (pFile == nullptr) {
        return false;
    }
    char buffer[255];
    while (std::fgets(buffer, sizeof buffer, pFile) != nullptr) {
        CSurveyPoint point;
        if (NaiveParse(buffer, set.GetCount(), point)) {
            set.Add(point);
        }
    }
    std::fclose(pFile);
    set.UpdateRange();
    return true;
}

template <class Read>
void Run(benchmark::State& state, Read read) {
    const long nLines = long(state.range(0));
    const std::string path = BenchFile(nLines);
    // One read outside the timing for the memory figures.
    int64_t nPeakPerPoint = 0;
    int64_t nKeptPerPoint = 0;
    {
        const int64_t nBefore = g_nLiveBytes.load();
        g_nPeakBytes.store(nBefore);
        CSurveyPointSet set;
        read(path.c_str(), set);
        const int64_t nPoints = std::max(set.GetCount(), 1);
        nPeakPerPoint = (g_nPeakBytes.load() - nBefore) / nPoints;
        nKeptPerPoint = (g_nLiveBytes.load() - nBefore) / nPoints;
        if (set.GetCount() != nLines) {
            state.SkipWithError("wrong number of points");
            return;
        }
    }
    CSurveyPointSet set;
    for (auto _ : state) {
        read(path.c_str(), set);
        benchmark::DoNotOptimize(set.GetCount());
    }
    state.SetItemsProcessed(state.iterations() * nLines);
    state.counters["ns_per_line"] =
        benchmark::Counter(double(state.iterations() * nLines),
                           benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
    state.counters["peak_B_per_pt"] = double(nPeakPerPoint);
    state.counters["kept_B_per_pt"] = double(nKeptPerPoint);
}

void BM_ReadFile(benchmark::State& state) {
    Run(state, [](const char* pszPath, CSurveyPointSet& set) { return set.ReadFile(pszPath); });
}

void BM_NaiveFgetsStrtod(benchmark::State& state) {
    Run(state, NaiveRead);
}

BENCHMARK(BM_ReadFile)->Arg(100000)->Arg(1000000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_NaiveFgetsStrtod)->Arg(100000)->Arg(1000000)->Unit(benchmark::kMillisecond);

}  // namespace

// Counting replacements of the global allocation functions (the sized and aligned forms forward
// here); they track the bytes in use and their peak.
#pragma GCC diagnostic ignored "-Wmismatched-new-delete"
void* operator new(std::size_t size) {
    void* p = std::malloc(size ? size : 1);
    if (p == nullptr) {
        throw std::bad_alloc();
    }
    const auto nSize = int64_t(malloc_usable_size(p));
    const int64_t nLive = g_nLiveBytes.fetch_add(nSize) + nSize;
    int64_t nPeak = g_nPeakBytes.load();
    while (nLive > nPeak && !g_nPeakBytes.compare_exchange_weak(nPeak, nLive)) {
    }
    return p;
}
void operator delete(void* p) noexcept {
    if (p != nullptr) {
        g_nLiveBytes.fetch_sub(int64_t(malloc_usable_size(p)));
    }
    std::free(p);
}
void operator delete(void* p, std::size_t) noexcept {
    operator delete(p);
}

int main(int argc, char** argv) {
    // Large arrays always from fresh pages, as for the first read in a process. Otherwise glibc
    // keeps a freed array of up to 32 MB for the next read, and the 100,000-line case would look
    // cheaper per line than the 1,000,000-line one only because it never faults its pages in.
    mallopt(M_MMAP_THRESHOLD, 1 << 20);
    for (long nLines : {100000L, 1000000L}) {
        WriteBenchFile(nLines);
    }
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    for (long nLines : {100000L, 1000000L}) {
        std::remove(BenchFile(nLines).c_str());
    }
    return 0;
}
