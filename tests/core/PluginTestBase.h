// Fixture for tests that drive the plug-in's code in this test executable as if it were the module:
// the executable carries the plug-in's resources and exports RegisterInProcMacro2, which hands the
// factory the test's recording host; message boxes are answered from a queue.
#pragma once

#include <gtest/gtest.h>

#include <deque>

#include "RecordingHost.h"
#include "core/KalmoretApp.h"
#include "core/KalmoretImpl.h"
#include "platform/HostDriver.h"

struct CMessageBoxSeen {
    std::string text;
    std::string caption;
    UINT type;
};

class PluginTest : public ::testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    // Loads the "module": InitInstance registers with the executable, which calls the factory.
    void Attach();
    CKalmoretImpl* Impl();
    // The host calls recorded from now on.
    void ClearCalls() { Host().m_calls.clear(); }

    static CRecordingHost& Host();
    static std::deque<int>& Answers();
    static std::vector<CMessageBoxSeen>& Boxes();
};
