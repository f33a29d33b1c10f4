// A small JSON document: built in memory, written as UTF-8 text with a stable layout, so that
// project files can be compared as text.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

class CJsonValue {
public:
    enum class EType { Null, Bool, Int, Float, String, Array, Object };

    CJsonValue() = default;  // null
    static CJsonValue Bool(bool bValue);
    static CJsonValue Int(int64_t nValue);
    static CJsonValue Float(float fValue);  // written with the fewest digits that read back exactly
    static CJsonValue String(std::string strUtf8);
    static CJsonValue Array();
    static CJsonValue Object();

    // Appends to an array; returns the stored element.
    CJsonValue& Add(CJsonValue value);
    // Sets a member of an object, keeping the order in which keys were first set.
    CJsonValue& Set(std::string_view key, CJsonValue value);

    EType Type() const { return m_eType; }
    size_t Size() const { return m_items.size(); }
    const CJsonValue& At(size_t i) const { return m_items[i]; }
    // The member with that key, or null when there is none.
    const CJsonValue* Find(std::string_view key) const;

    // Layout: an object or array on one line when it fits in 100 columns, else one element a line
    // indented by two blanks; the document ends with a line break.
    std::string Write() const;

private:
    void WriteTo(std::string& out, size_t nIndent) const;
    void WriteCompact(std::string& out) const;
    void WriteScalar(std::string& out) const;
    bool IsContainer() const { return m_eType == EType::Array || m_eType == EType::Object; }

    EType m_eType = EType::Null;
    bool m_bValue = false;
    int64_t m_nValue = 0;
    float m_fValue = 0;
    std::string m_strValue;
    std::vector<std::string> m_keys;  // objects only, parallel to m_items
    std::vector<CJsonValue> m_items;
};

// The shortest decimal text that reads back as exactly this float; "null" for NaN and infinities,
// which JSON cannot hold.
std::string FormatJsonFloat(float fValue);
// A UTF-8 string as a JSON string literal with its quotes.
std::string QuoteJson(std::string_view utf8);
