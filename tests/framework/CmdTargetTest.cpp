#include "framework/CmdTarget.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

// A target with two methods: Add(long, float, BOOL ref) and Ping() without parameters.
class CProbe : public CCmdTarget {
public:
    LONG m_lSum = 0;
    int m_nPings = 0;

protected:
    std::span<const CDispatchEntry> GetDispatchMap() const override {
        static const CDispatchEntry map[] = {
            {1, "", [](CCmdTarget* p, const CDispArgs&) { ++static_cast<CProbe*>(p)->m_nPings; }},
            {2, "lfB",
             [](CCmdTarget* p, const CDispArgs& args) {
                 static_cast<CProbe*>(p)->m_lSum += args.Long(0) + LONG(args.Float(1));
             }},
            {3, "l", nullptr},
            {4, "", [](CCmdTarget*, const CDispArgs&) { throw 1; }},
        };
        return map;
    }
};

// Arguments are given in declaration order and stored reversed, as DISPPARAMS wants them.
HRESULT Call(CProbe& probe, DISPID id, std::vector<VARIANT> args, UINT* puArgErr = nullptr) {
    std::vector<VARIANT> reversed(args.rbegin(), args.rend());
    DISPPARAMS params{reversed.data(), nullptr, UINT(reversed.size()), 0};
    return probe.Invoke(id, IID_NULL, 0, DISPATCH_METHOD, &params, nullptr, nullptr, puArgErr);
}

VARIANT Long(LONG l) {
    VARIANT v{};
    v.vt = VT_I4;
    v.lVal = l;
    return v;
}

VARIANT Float(float f) {
    VARIANT v{};
    v.vt = VT_R4;
    v.fltVal = f;
    return v;
}

VARIANT BoolRef(VARIANT_BOOL* p) {
    VARIANT v{};
    v.vt = VT_BYREF | VT_BOOL;
    v.pboolVal = p;
    return v;
}

TEST(CmdTarget, InvokeChecksArgumentsBeforeAnyHandlerRuns) {
    CProbe probe;
    VARIANT_BOOL flag = VARIANT_FALSE;
    EXPECT_EQ(Call(probe, 2, {Long(40), Float(2.5f), BoolRef(&flag)}), S_OK);
    EXPECT_EQ(probe.m_lSum, 42);

    UINT argErr = 0xdeadbeef;
    static const struct {
        std::vector<VARIANT> args;
        HRESULT expected;
        UINT argErr;  // rgvarg index of the offending argument
    } cases[] = {
        {{Float(1), Float(2), BoolRef(&flag)}, DISP_E_TYPEMISMATCH, 2},
        {{Long(1), Long(2), BoolRef(&flag)}, DISP_E_TYPEMISMATCH, 1},
        {{Long(1), Float(2), BoolRef(nullptr)}, DISP_E_TYPEMISMATCH, 0},
        {{Long(1), Float(2)}, DISP_E_BADPARAMCOUNT, 0xdeadbeef},
        {{}, DISP_E_BADPARAMCOUNT, 0xdeadbeef},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        argErr = 0xdeadbeef;
        EXPECT_EQ(Call(probe, 2, cases[i].args, &argErr), cases[i].expected) << "case " << i;
        EXPECT_EQ(argErr, cases[i].argErr) << "case " << i;
    }
    EXPECT_EQ(probe.m_lSum, 42);  // no refused call reached the handler
}

TEST(CmdTarget, UnknownMembersIgnoredEntriesAndExceptions) {
    CProbe probe;
    EXPECT_EQ(Call(probe, 1, {}), S_OK);
    EXPECT_EQ(probe.m_nPings, 1);
    EXPECT_EQ(Call(probe, 3, {Long(5)}), S_OK);  // accepted without effect
    EXPECT_EQ(Call(probe, 99, {}), DISP_E_MEMBERNOTFOUND);
    EXPECT_EQ(Call(probe, 4, {}), DISP_E_EXCEPTION);  // nothing escapes to the caller
    DISPPARAMS none{nullptr, nullptr, 0, 0};
    EXPECT_EQ(probe.Invoke(1, IID_IDispatch, 0, DISPATCH_METHOD, &none, nullptr, nullptr, nullptr),
              DISP_E_UNKNOWNINTERFACE);
}

TEST(CmdTarget, ReferenceCountingAndInterfaces) {
    auto* probe = new CProbe;  // starts with the creator's reference
    void* p = nullptr;
    EXPECT_EQ(probe->QueryInterface(IID_IDispatch, &p), S_OK);
    EXPECT_EQ(p, static_cast<IDispatch*>(probe));
    EXPECT_EQ(probe->QueryInterface(IID_IConnectionPoint, &p), E_NOINTERFACE);
    EXPECT_EQ(p, nullptr);
    EXPECT_EQ(probe->ExternalAddRef(), 3u);
    EXPECT_EQ(probe->ExternalRelease(), 2u);
    EXPECT_EQ(probe->Release(), 1u);
    EXPECT_EQ(probe->Release(), 0u);  // deleted; the sanitizers check
}

}  // namespace
