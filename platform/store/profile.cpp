#include "platform/store/profile.h"

#include <algorithm>
#include <iostream>

namespace platform {

CProfileSection CProfileSection::Unread() {
  CProfileSection section;
  section.m_bRead = false;
  return section;
}

int CProfileSection::GetInt(const std::string& entry, int absent) const {
  const Value* value = Find(entry);
  return value == nullptr ? absent : value->number.value_or(absent);
}

std::string CProfileSection::GetString(const std::string& entry, const std::string& absent) const {
  const Value* value = Find(entry);
  return value == nullptr || value->number ? absent : value->text;
}

const CProfileSection::Value* CProfileSection::Find(const std::string& entry) const {
  const auto found = m_values.find(entry);
  return found == m_values.end() ? nullptr : &found->second;
}

void CProfileSection::Put(const std::string& entry, const Value& value) {
  m_changes.emplace_back(entry, value);
  m_values.insert_or_assign(entry, value);
}

std::vector<std::string> CProfile::TakeTroubles() { return std::exchange(m_troubles, {}); }

void CProfile::Tell(const std::string& trouble) {
  std::cerr << trouble << '\n';
  if (std::find(m_told.begin(), m_told.end(), trouble) != m_told.end()) return;
  m_told.push_back(trouble);
  m_troubles.push_back(trouble);
}

}  // namespace platform
