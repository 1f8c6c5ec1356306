#include "fuzz/bytes.h"

#include <algorithm>
#include <cstdlib>
#include <iostream>

namespace feltside::fuzz {

std::string CBytes::Take(std::size_t count) {
  std::string taken = AtEnd() ? "" : m_bytes.substr(m_nAt, count);
  m_nAt += taken.size();
  return taken;
}

int CBytes::Number(int from, int to) {
  const auto range = static_cast<std::uint32_t>(to - from) + 1;
  std::uint32_t number = 0;
  for (std::uint32_t left = range - 1; left > 0; left >>= 8) {
    const std::string byte = Take(1);
    number = number << 8 | (byte.empty() ? 0U : static_cast<unsigned char>(byte[0]));
  }
  return from + static_cast<int>(range == 0 ? number : number % range);
}

const std::string& CBytes::OneOf(const std::vector<std::string>& texts) {
  return texts[static_cast<std::size_t>(Number(0, static_cast<int>(texts.size()) - 1))];
}

std::string CBytes::Text() { return Take(static_cast<std::size_t>(Number(0, 255))); }

std::string CBytes::Rest() { return Take(m_bytes.size()); }

void Require(bool holds, const std::string& what) {
  if (holds) return;
  std::cerr << what << std::endl;
  std::abort();
}

}  // namespace feltside::fuzz
