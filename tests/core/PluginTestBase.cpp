#include "PluginTestBase.h"

namespace {

CKalmoretApp g_app;
std::deque<int> g_answers;
std::vector<CMessageBoxSeen> g_boxes;

int AnswerBox(void*, LPCSTR text, LPCSTR caption, UINT type) {
    g_boxes.push_back({text, caption, type});
    if (g_answers.empty()) {
        ADD_FAILURE() << "unexpected message box: " << text;
        return IDCANCEL;
    }
    const int answer = g_answers.front();
    g_answers.pop_front();
    return answer;
}

}  // namespace

void PluginTest::SetUp() {
    Session().State().lModeFlags = 0x7F;  // every interactive-mode bit and one above them
    g_answers.clear();
    g_boxes.clear();
    DriverSetMessageBoxProc(AnswerBox, nullptr);
}

void PluginTest::TearDown() {
    AfxModuleDetach();  // ExitInstance deletes the automation object
    m_pSession->CheckLeaks();
    for (const CLeakRecord& leak : Project().leaks) {
        ADD_FAILURE() << "the plug-in still holds " << leak.strObject << " " << leak.lRefs << "x";
    }
    EXPECT_TRUE(g_answers.empty()) << "message box answers left over";
    m_pSession.reset();
    DriverSetMessageBoxProc(nullptr, nullptr);
    MSG msg;
    while (PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE)) {
    }
    KillTimer(DriverGetMainWindow(), kShutdownTimerId);
}

void PluginTest::Attach() {
    ASSERT_TRUE(AfxModuleAttach(GetModuleHandleA(nullptr)));
}

CKalmoretImpl* PluginTest::Impl() {
    return g_app.m_pImpl;
}

Calls PluginTest::TakeTrace() {
    Calls calls;
    for (std::string& line : Project().trace) {
        if (line.find(".AddRef()") == std::string::npos &&
            line.find(".Release() -> ") == std::string::npos) {
            calls.push_back(std::move(line));
        }
    }
    Project().trace.clear();
    return calls;
}

std::deque<int>& PluginTest::Answers() {
    return g_answers;
}
std::vector<CMessageBoxSeen>& PluginTest::Boxes() {
    return g_boxes;
}
