#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace feltside::fuzz {

/// The bytes of an input, taken from the front as decisions. Behind their end every number is the
/// lowest and every text empty.
class CBytes {
 public:
  CBytes(const std::uint8_t* data, std::size_t size)
      : m_bytes(reinterpret_cast<const char*>(data), size) {}

  bool AtEnd() const { return m_nAt >= m_bytes.size(); }
  int Number(int from, int to);
  /// One out of a list that is not empty.
  const std::string& OneOf(const std::vector<std::string>& texts);
  /// As many bytes as the next one says.
  std::string Text();
  std::string Rest();

 private:
  std::string Take(std::size_t count);

  std::string m_bytes;
  std::size_t m_nAt = 0;
};

/// Ends the program, with the input kept, unless a condition holds; says what was wrong.
void Require(bool holds, const std::string& what);

}  // namespace feltside::fuzz

/// What each target is: takes one input, returns 0.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);
