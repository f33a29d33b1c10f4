// The automation object's dispatch map: all 52 events of the host's event interface, with their
// parameter types. Four act; the others are checked and accepted without effect.
#include <array>

#include "core/HostEvents.h"
#include "core/KalmoretImpl.h"

namespace {

CKalmoretImpl* Impl(CCmdTarget* pTarget) {
    return static_cast<CKalmoretImpl*>(pTarget);
}

void ProgramExit(CCmdTarget* pTarget, const CDispArgs&) {
    Impl(pTarget)->OnProgramExit();
}

void ButtonChange(CCmdTarget* pTarget, const CDispArgs& args) {
    Impl(pTarget)->OnButtonChange(args.Long(0), args.Long(1));
}

void HowMove(CCmdTarget* pTarget, const CDispArgs& args) {
    Impl(pTarget)->OnHowMove(args.Long(0), args.Float(1), args.Float(2));
}

void HowInput(CCmdTarget* pTarget, const CDispArgs& args) {
    Impl(pTarget)->OnHowInput(args.Long(0), args.Float(1), args.Float(2), args.Long(5));
}

constexpr decltype(CDispatchEntry::pfnHandler) HandlerOf(DISPID id) {
    switch (id) {
        case kEventProgramExit:
            return ProgramExit;
        case kEventButtonChange:
            return ButtonChange;
        case kEventHowMove:
            return HowMove;
        case kEventHowInput:
            return HowInput;
        default:
            return nullptr;
    }
}

constexpr std::array<CDispatchEntry, std::size(kOsrikEvents)> MakeDispatchMap() {
    std::array<CDispatchEntry, std::size(kOsrikEvents)> map{};
    for (size_t i = 0; i < map.size(); ++i) {
        map[i] = {kOsrikEvents[i].id, kOsrikEvents[i].params, HandlerOf(kOsrikEvents[i].id)};
    }
    return map;
}

constexpr auto kDispatchMap = MakeDispatchMap();

}  // namespace

std::span<const CDispatchEntry> CKalmoretImpl::GetDispatchMap() const {
    return kDispatchMap;
}

bool CKalmoretImpl::IsDispatchInterface(REFIID riid) const {
    return IsEqualIID(riid, IID_IOsrikEvents);
}
