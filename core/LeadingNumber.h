// The decimal number at the start of a text, as the Windows runtime's atof reads it.
#pragma once

// Skips leading white space, then reads [sign] digits [. digits] [e [sign] digits] and stops at the
// first character that cannot continue it: "12,5" gives 12, "abc" and "" give 0. Unlike atof it is
// independent of the C locale, has no undefined behaviour on huge exponents (a value beyond the
// double range gives 0, a tiny one 0 as well) and takes no "inf", "nan" or hexadecimal forms, which
// the runtime of the original platform did not know either. Does not throw or allocate.
double ParseLeadingNumber(const char* pszText);
