#include "PluginTestBase.h"

namespace {

CKalmoretApp g_app;
CRecordingHost* g_pHost = nullptr;
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

// The registration entry the plug-in looks up in the executable that loaded it.
extern "C" __attribute__((visibility("default"))) LONG RegisterInProcMacro2(
    HINSTANCE, CREATEMACROOBJECT pfnFactory, LONG) {
    return pfnFactory(static_cast<IOsrikApplication*>(g_pHost), 0);
}

void PluginTest::SetUp() {
    g_pHost = new CRecordingHost;
    g_answers.clear();
    g_boxes.clear();
    DriverSetMessageBoxProc(AnswerBox, nullptr);
}

void PluginTest::TearDown() {
    AfxModuleDetach();  // ExitInstance deletes the automation object
    EXPECT_EQ(g_pHost->m_nRefs, 1u) << "the plug-in still holds host references";
    EXPECT_TRUE(g_pHost->HeldObjects().empty()) << "the plug-in still holds host objects";
    EXPECT_TRUE(g_answers.empty()) << "message box answers left over";
    delete g_pHost;
    g_pHost = nullptr;
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
CRecordingHost& PluginTest::Host() {
    return *g_pHost;
}
std::deque<int>& PluginTest::Answers() {
    return g_answers;
}
std::vector<CMessageBoxSeen>& PluginTest::Boxes() {
    return g_boxes;
}
