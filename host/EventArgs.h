// The arguments of one host event, built by the event's parameter letters (core/HostEvents.h):
// every value starts zero, empty or null, and by-reference parameters point at host-owned zero
// values for the sink to write. DISPPARAMS holds them in reverse order, as IDispatch::Invoke wants.
#pragma once

#include <string>
#include <vector>

#include "core/HostEvents.h"

class CEventArgs {
public:
    // The event must be one of the 52 of the host's event interface.
    explicit CEventArgs(const COsrikEventInfo& event);
    CEventArgs(const CEventArgs&) = delete;
    CEventArgs& operator=(const CEventArgs&) = delete;
    ~CEventArgs();

    // Set argument i (declaration order) of type l, f or b; mismatched types are a programming
    // error and leave the argument as it was.
    void SetLong(size_t i, LONG lValue);
    void SetFloat(size_t i, float fValue);
    void SetBool(size_t i, bool bValue);

    // The arguments for Invoke, valid while this object lives.
    DISPPARAMS Params();
    // "ButtonChange(1, 4, 0, false, false, false)", with the values by-reference targets hold now.
    std::string Describe() const;
    const COsrikEventInfo& Event() const { return m_event; }

private:
    // The host-owned value a by-reference argument points at.
    struct CRefTarget {
        LONG lValue = 0;
        VARIANT_BOOL boolValue = VARIANT_FALSE;
        VARIANT varValue{};
    };

    const COsrikEventInfo& m_event;
    std::vector<VARIANT> m_args;      // declaration order
    std::vector<VARIANT> m_reversed;  // what DISPPARAMS points at
    std::vector<CRefTarget> m_targets;
};
