// The contour tool's last settings and the import dialog's last folder, and the settings file
// "Standard\Makros\Kalmoret.ini" below the host's folder that keeps them between runs.
//
// CKalmoretSettings is the automation object's share of this state: the automation object derives
// from it, so the members keep their names there (m_pImpl->m_fHeight), and the application object's
// LoadSettings and SaveSettings hand it to the functions below. The dialogs work on the members.
#pragma once

#include "framework/String.h"

struct CKalmoretSettings {
    float m_fHeight = 0.0f;  // height of the contour line, metres ("Height")
    int m_nInterpol = 0;     // 0 as entered, 1 linear, 2 spline ("Interpol")
    float m_fSegLen = 0.0f;  // maximum segment length, metres ("SegLen")
    CString m_strPath;       // last folder of the surveyor-file dialog, no trailing '\' ("Path")
};

// The key's value read by the profile functions (at most 255 characters) and converted as atof
// does (ParseLeadingNumber): a missing or empty key and a text without a leading number give 0.
double ReadProfileDouble(const CString& strSection, const CString& strKey, const CString& strFile);

// Fills all four members from section "Recent" of strFile; missing keys give 0 and an empty folder.
// A value beyond the float range reads as 0, as a number that is not one does.
void ReadSettingsFile(const CString& strFile, CKalmoretSettings& settings);
// Writes the four keys (heights with six decimals, "12.500000"). A file that cannot be written is
// not reported: the values simply stay in memory.
void WriteSettingsFile(const CString& strFile, const CKalmoretSettings& settings);

// The two above on the settings file below the host's folder. When the host executable has
// neither host name there is no settings file: nothing is read or written, the members stay as
// they are, and the result is false.
bool LoadSettings(CKalmoretSettings& settings);
bool SaveSettings(const CKalmoretSettings& settings);
