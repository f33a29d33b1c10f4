// CEditGroup: the bracket around a series of changes to the host's project.
//
// Opening it clears the host's five lowest mode flags, turns batch mode on and begins a named edit
// group; Commit keeps the changes, Cancel discards them, and the destructor cancels a group still
// open, restores the mode flags and releases the host. A group the host did not open (handle 0)
// makes Commit and Cancel do nothing; the changes are then made outside a group.
#pragma once

#include "core/HostInterfaces.h"

class CEditGroup {
public:
    // nIDName: string-table number of the group's name.
    CEditGroup(IOsrikApplication* pHost, UINT nIDName);
    ~CEditGroup();
    CEditGroup(const CEditGroup&) = delete;
    CEditGroup& operator=(const CEditGroup&) = delete;

    void Commit() { End(-1); }
    void Cancel() { End(0); }

private:
    void End(LONG lKeep);

    IOsrikApplication* m_pHost;
    LONG m_lSavedFlags = 0;
    LONG m_lGroup = 0;
};
