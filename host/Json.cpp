#include "host/Json.h"

#include <charconv>
#include <cmath>
#include <cstdio>

namespace {

constexpr size_t kLineWidth = 100;

}  // namespace

CJsonValue CJsonValue::Bool(bool bValue) {
    CJsonValue value;
    value.m_eType = EType::Bool;
    value.m_bValue = bValue;
    return value;
}

CJsonValue CJsonValue::Int(int64_t nValue) {
    CJsonValue value;
    value.m_eType = EType::Int;
    value.m_nValue = nValue;
    return value;
}

CJsonValue CJsonValue::Float(float fValue) {
    CJsonValue value;
    value.m_eType = EType::Float;
    value.m_fValue = fValue;
    return value;
}

CJsonValue CJsonValue::String(std::string strUtf8) {
    CJsonValue value;
    value.m_eType = EType::String;
    value.m_strValue = std::move(strUtf8);
    return value;
}

CJsonValue CJsonValue::Array() {
    CJsonValue value;
    value.m_eType = EType::Array;
    return value;
}

CJsonValue CJsonValue::Object() {
    CJsonValue value;
    value.m_eType = EType::Object;
    return value;
}

CJsonValue& CJsonValue::Add(CJsonValue value) {
    m_items.push_back(std::move(value));
    return m_items.back();
}

CJsonValue& CJsonValue::Set(std::string_view key, CJsonValue value) {
    for (size_t i = 0; i < m_keys.size(); ++i) {
        if (m_keys[i] == key) {
            m_items[i] = std::move(value);
            return m_items[i];
        }
    }
    m_keys.emplace_back(key);
    m_items.push_back(std::move(value));
    return m_items.back();
}

const CJsonValue* CJsonValue::Find(std::string_view key) const {
    for (size_t i = 0; i < m_keys.size(); ++i) {
        if (m_keys[i] == key) {
            return &m_items[i];
        }
    }
    return nullptr;
}

std::string CJsonValue::Write() const {
    std::string out;
    WriteTo(out, 0);
    out += '\n';
    return out;
}

void CJsonValue::WriteTo(std::string& out, size_t nIndent) const {
    if (!IsContainer()) {
        WriteScalar(out);
        return;
    }
    const bool bObject = m_eType == EType::Object;
    if (nIndent > 0 || m_items.empty()) {
        std::string compact;
        WriteCompact(compact);
        if (nIndent + compact.size() <= kLineWidth) {
            out += compact;
            return;
        }
    }
    out += bObject ? '{' : '[';
    const std::string pad(nIndent + 2, ' ');
    for (size_t i = 0; i < m_items.size(); ++i) {
        out += i ? ",\n" : "\n";
        out += pad;
        if (bObject) {
            out += QuoteJson(m_keys[i]);
            out += ": ";
        }
        m_items[i].WriteTo(out, nIndent + 2);
    }
    out += '\n';
    out.append(nIndent, ' ');
    out += bObject ? '}' : ']';
}

void CJsonValue::WriteCompact(std::string& out) const {
    if (!IsContainer()) {
        WriteScalar(out);
        return;
    }
    const bool bObject = m_eType == EType::Object;
    out += bObject ? '{' : '[';
    for (size_t i = 0; i < m_items.size(); ++i) {
        if (i) {
            out += ", ";
        }
        if (bObject) {
            out += QuoteJson(m_keys[i]);
            out += ": ";
        }
        m_items[i].WriteCompact(out);
    }
    out += bObject ? '}' : ']';
}

void CJsonValue::WriteScalar(std::string& out) const {
    switch (m_eType) {
        case EType::Bool:
            out += m_bValue ? "true" : "false";
            break;
        case EType::Int:
            out += std::to_string(m_nValue);
            break;
        case EType::Float:
            out += FormatJsonFloat(m_fValue);
            break;
        case EType::String:
            out += QuoteJson(m_strValue);
            break;
        default:
            out += "null";
            break;
    }
}

std::string FormatJsonFloat(float fValue) {
    if (!std::isfinite(fValue)) {
        return "null";
    }
    char buffer[32];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, fValue);
    return std::string(buffer, result.ptr);
}

std::string QuoteJson(std::string_view utf8) {
    std::string out = "\"";
    for (const char c : utf8) {
        switch (c) {
            case '"':
                out += "\\\"";
                break;
            case '\\':
                out += "\\\\";
                break;
            case '\n':
                out += "\\n";
                break;
            case '\r':
                out += "\\r";
                break;
            case '\t':
                out += "\\t";
                break;
            default:
                if (static_cast<unsigned char>(c) < 0x20) {
                    char escape[8];
                    std::snprintf(escape, sizeof escape, "\\u%04x", unsigned(c));
                    out += escape;
                } else {
                    out += c;
                }
        }
    }
    out += '"';
    return out;
}
