// The command line of Osrik.exe: what it refuses. Every scenario run passes the options it uses.
#include <gtest/gtest.h>

#include "host/CommandLine.h"

namespace {

TEST(ParseCommandLine, RefusesWhatItCannotUse) {
    static const struct {
        std::vector<const char*> args;
        const char* pszError;
    } kCases[] = {
        {{}, "no scenario given"},
        {{"--trace"}, "no scenario given"},
        {{"a.scn", "b.scn"}, "more than one scenario: a.scn, b.scn"},
        {{"--out"}, "--out needs a value"},
        {{"a.scn", "--plugin", ""}, "--plugin needs a value"},
        {{"-x", "a.scn"}, "unknown option -x"},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        std::vector<const char*> argv{"Osrik.exe"};
        argv.insert(argv.end(), kCases[i].args.begin(), kCases[i].args.end());
        COptions options;
        std::string error;
        EXPECT_FALSE(ParseCommandLine(int(argv.size()), argv.data(), options, error))
            << "case " << i;
        EXPECT_EQ(error, kCases[i].pszError) << "case " << i;
    }
}

}  // namespace
