#include "host/Project.h"

#include <algorithm>

void CPropertyList::Set(std::string_view name, CValue value) {
    for (auto& item : m_items) {
        if (item.first == name) {
            item.second = std::move(value);
            return;
        }
    }
    m_items.emplace_back(std::string(name), std::move(value));
}

const CPropertyList::CValue* CPropertyList::Find(std::string_view name) const {
    for (const auto& item : m_items) {
        if (item.first == name) {
            return &item.second;
        }
    }
    return nullptr;
}

LONG CProject::BeginEditGroup(std::string strName) {
    editGroups.push_back({std::move(strName), EGroupState::Open});
    return LONG(editGroups.size());
}

bool CProject::ActivateEditGroup(LONG lGroup) {
    if (lGroup <= 0 || size_t(lGroup) > editGroups.size() ||
        editGroups[size_t(lGroup) - 1].eState != EGroupState::Open) {
        return false;
    }
    const size_t nIndex = size_t(lGroup) - 1;
    std::erase(m_activeStack, nIndex);
    m_activeStack.push_back(nIndex);
    return true;
}

bool CProject::EndEditGroup(LONG lGroup, bool bKeep) {
    if (lGroup <= 0 || size_t(lGroup) > editGroups.size() ||
        editGroups[size_t(lGroup) - 1].eState != EGroupState::Open) {
        return false;
    }
    const size_t nIndex = size_t(lGroup) - 1;
    editGroups[nIndex].eState = bKeep ? EGroupState::Committed : EGroupState::Cancelled;
    std::erase(m_activeStack, nIndex);
    return true;
}

std::optional<size_t> CProject::ActiveGroup() const {
    if (m_activeStack.empty()) {
        return std::nullopt;
    }
    return m_activeStack.back();
}

const CToolbarElement* CProject::FindToolbarElement(LONG lHandle) const {
    const auto it =
        std::find_if(toolbar.begin(), toolbar.end(),
                     [lHandle](const CToolbarElement& e) { return e.lHandle == lHandle; });
    return it == toolbar.end() ? nullptr : &*it;
}
