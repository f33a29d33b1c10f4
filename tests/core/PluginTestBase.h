// Fixture for tests that drive the plug-in's code in this test executable as if
// it were the module, against the reference host's objects in process: the
// executable carries the plug-in's resources and, from the host library,
// exports RegisterInProcMacro2, which hands the factory the session's
// application. Message boxes are answered from a queue. Every test ends with
// the check that the plug-in gave back every host object it took.
#pragma once

#include <gtest/gtest.h>

#include <deque>
#include <memory>
#include <string>
#include <vector>

#include "core/KalmoretApp.h"
#include "core/KalmoretImpl.h"
#include "host/Session.h"
#include "platform/HostDriver.h"

using Calls = std::vector<std::string>;

struct CMessageBoxSeen {
    std::string text;
    std::string caption;
    UINT type;
};

class PluginTest : public ::testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    // Loads the "module": InitInstance registers with the executable, which calls
    // the factory.
    void Attach();
    CKalmoretImpl* Impl();
    CHostSession& Session() { return *m_pSession; }
    CProject& Project() { return m_pSession->State().project; }
    // The host calls traced since the last look, without AddRef and Release (the
    // final check covers references).
    Calls TakeTrace();

    static std::deque<int>& Answers();
    static std::vector<CMessageBoxSeen>& Boxes();

private:
    std::unique_ptr<CHostSession> m_pSession = std::make_unique<CHostSession>("C:\\Osrik\\", true);
};

// The plug-in attached to a fresh host; what the connection traced is dropped.
class AttachedTest : public PluginTest {
protected:
    void SetUp() override {
        PluginTest::SetUp();
        Attach();
        TakeTrace();
    }
};
