// Osrik.exe, the reference host: loads the plug-in from beside itself (or --plugin), runs a
// scenario script against it and writes the resulting project as JSON (and, with --svg, as a plan
// drawing).
#include <cstdio>
#include <fstream>
#include <sstream>
#include <vector>

#include "host/CommandLine.h"
#include "host/ProjectJson.h"
#include "host/ScenarioRunner.h"
#include "host/Svg.h"

namespace {

int Fail(const std::string& strReason, int nStatus = 1) {
    std::fprintf(stderr, "Osrik.exe: %s\n", strReason.c_str());
    return nStatus;
}

bool ReadWholeFile(const std::string& strPath, std::string& text) {
    std::ifstream file(strPath, std::ios::binary);
    if (!file) {
        return false;
    }
    std::ostringstream stream;
    stream << file.rdbuf();
    text = stream.str();
    return !file.bad();
}

bool WriteWholeFile(const std::string& strPath, const std::string& text) {
    if (strPath.empty()) {
        return std::fwrite(text.data(), 1, text.size(), stdout) == text.size() &&
               std::fflush(stdout) == 0;
    }
    std::ofstream file(strPath, std::ios::binary);
    file << text;
    file.close();
    return bool(file);
}

// The executable's folder with its trailing separator, as the plug-in expects from GetProgramPath.
std::string ProgramFolder() {
    std::vector<char> buffer(32768);
    const DWORD nLength = GetModuleFileNameA(nullptr, buffer.data(), DWORD(buffer.size()));
    const std::string strPath(buffer.data(), nLength < buffer.size() ? nLength : 0);
    const size_t nSeparator = strPath.find_last_of("/\\");
    return nSeparator == std::string::npos ? std::string() : strPath.substr(0, nSeparator + 1);
}

}  // namespace

int main(int argc, char** argv) {
    COptions options;
    std::string strError;
    if (!ParseCommandLine(argc, argv, options, strError)) {
        return Fail(strError + " (" + kUsage + ")", 2);
    }
    std::string strText;
    if (!ReadWholeFile(options.strScenario, strText)) {
        return Fail("cannot read the scenario " + options.strScenario);
    }
    const CScenario scenario = ParseScenario(strText);
    if (!scenario.strError.empty()) {
        return Fail(options.strScenario + ": " + scenario.strError);
    }
    const std::string strFolder = ProgramFolder();
    const std::string strPlugin =
        options.strPlugin.empty() ? strFolder + OSRIK_PLUGIN_FILE : options.strPlugin;

    std::string strFailure, strJson, strSvg;
    {
        CHostSession session(strFolder, options.bTrace);
        CUiDriver driver(session.State());
        if (!session.Load(strPlugin, strFailure)) {
            return Fail(strFailure);
        }
        strFailure = CScenarioRunner(session, driver).Run(scenario.commands);
        session.Shutdown();
        if (strFailure.empty()) {
            strFailure = driver.Failure();  // a modal UI opened while shutting down
        }
        strJson = ProjectToJson(session.State().project, options.bTrace).Write();
        if (!options.strSvg.empty()) {
            strSvg = DrawPlan(session.State().project);
        }
    }
    if (!WriteWholeFile(options.strOut, strJson)) {
        return Fail("cannot write the project to " + options.strOut);
    }
    if (!options.strSvg.empty() && !WriteWholeFile(options.strSvg, strSvg)) {
        return Fail("cannot write the plan to " + options.strSvg);
    }
    return strFailure.empty() ? 0 : Fail(options.strScenario + ": " + strFailure);
}
