#include "core/Settings.h"

#include <cfloat>
#include <charconv>
#include <cmath>

#include "core/HostPath.h"
#include "core/LeadingNumber.h"
#include "platform/Win32.h"
#include "res/resource.h"

namespace {

CString LoadText(UINT nID) {
    CString strText;
    strText.LoadString(nID);
    return strText;
}

// The stored double narrowed to the float member; outside the float range it would become an
// infinity that the geometry cannot use, so it reads as 0 like any other non-number.
float ToFloatSetting(double fValue) {
    return std::fabs(fValue) <= double(FLT_MAX) ? static_cast<float>(fValue) : 0.0f;
}

// "%f" of the C locale, also when the host has set another locale: the file must read back.
CString FormatFixed6(float fValue) {
    char szText[64];
    const auto result =
        std::to_chars(szText, szText + sizeof szText, double(fValue), std::chars_format::fixed, 6);
    return result.ec == std::errc() ? CString(szText, int(result.ptr - szText)) : CString("0");
}

}  // namespace

double ReadProfileDouble(const CString& strSection, const CString& strKey, const CString& strFile) {
    char szValue[256] = {};
    if (GetPrivateProfileStringA(strSection, strKey, "0", szValue, sizeof szValue, strFile) == 0) {
        szValue[0] = '0';
        szValue[1] = '\0';
    }
    return ParseLeadingNumber(szValue);
}

void ReadSettingsFile(const CString& strFile, CKalmoretSettings& settings) {
    const CString strSection = LoadText(IDS_SETTINGS_SECTION);
    settings.m_fHeight =
        ToFloatSetting(ReadProfileDouble(strSection, LoadText(IDS_KEY_HEIGHT), strFile));
    settings.m_fSegLen =
        ToFloatSetting(ReadProfileDouble(strSection, LoadText(IDS_KEY_SEGLEN), strFile));
    settings.m_nInterpol =
        static_cast<int>(GetPrivateProfileIntA(strSection, LoadText(IDS_KEY_INTERPOL), 0, strFile));
    char szPath[512] = {};
    if (GetPrivateProfileStringA(strSection, LoadText(IDS_KEY_PATH), "", szPath, sizeof szPath,
                                 strFile) == 0) {
        settings.m_strPath.Empty();
    } else {
        settings.m_strPath = szPath;
    }
}

void WriteSettingsFile(const CString& strFile, const CKalmoretSettings& settings) {
    const CString strSection = LoadText(IDS_SETTINGS_SECTION);
    CString strInterpol;
    strInterpol.Format("%d", settings.m_nInterpol);
    // Failures are not reported: an unwritable file keeps the values in memory only.
    WritePrivateProfileStringA(strSection, LoadText(IDS_KEY_HEIGHT),
                               FormatFixed6(settings.m_fHeight), strFile);
    WritePrivateProfileStringA(strSection, LoadText(IDS_KEY_SEGLEN),
                               FormatFixed6(settings.m_fSegLen), strFile);
    WritePrivateProfileStringA(strSection, LoadText(IDS_KEY_INTERPOL), strInterpol, strFile);
    WritePrivateProfileStringA(strSection, LoadText(IDS_KEY_PATH), settings.m_strPath, strFile);
}

bool LoadSettings(CKalmoretSettings& settings) {
    CString strFile;
    if (!GetHostRelativePath(IDS_SETTINGS_FILE, strFile)) {
        return false;
    }
    ReadSettingsFile(strFile, settings);
    return true;
}

bool SaveSettings(const CKalmoretSettings& settings) {
    CString strFile;
    if (!GetHostRelativePath(IDS_SETTINGS_FILE, strFile)) {
        return false;
    }
    WriteSettingsFile(strFile, settings);
    return true;
}
