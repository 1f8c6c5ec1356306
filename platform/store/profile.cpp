#include "platform/store/profile.h"

#include <algorithm>
#include <cstdio>

namespace platform {

int CProfileSection::GetInt(const std::string& entry, int absent) const {
  const Value* value = Find(entry);
  return value == nullptr ? absent : value->number.value_or(absent);
}

std::string CProfileSection::GetString(const std::string& entry, const std::string& absent) const {
  const Value* value = Find(entry);
  return value == nullptr || value->number ? absent : value->text;
}

const CProfileSection::Value* CProfileSection::Find(const std::string& entry) const {
  const auto found = m_mapValues.find(entry);
  return found == m_mapValues.end() ? nullptr : &found->second;
}

void CProfileSection::Put(const std::string& entry, const Value& value) {
  m_arrChanges.emplace_back(entry, value);
  m_mapValues.insert_or_assign(entry, value);
}

std::vector<std::string> CProfile::TakeTroubles() { return std::exchange(m_arrTroubles, {}); }

void CProfile::Tell(const std::string& trouble) {
  std::fprintf(stderr, "%s\n", trouble.c_str());
  if (std::find(m_arrTold.begin(), m_arrTold.end(), trouble) != m_arrTold.end()) return;
  m_arrTold.push_back(trouble);
  m_arrTroubles.push_back(trouble);
}

}  // namespace platform
