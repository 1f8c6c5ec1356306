#pragma once

#include <filesystem>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace platform {

/// The integers and strings of one section of the profile, as they were read at one moment.
class CProfileSection {
 public:
  /// An integer or, where there is none, a string.
  struct Value {
    std::optional<int> number;
    std::string text;
  };

  CProfileSection() = default;
  explicit CProfileSection(std::map<std::string, Value> stored) : m_mapValues(std::move(stored)) {}

  // A missing value, or one of the other type, reads as the default.
  int GetInt(const std::string& entry, int absent) const;
  std::string GetString(const std::string& entry, const std::string& absent) const;

  /// Changes a value here; only CProfile::Update stores it.
  void Set(const std::string& entry, int number) { Put(entry, {number, {}}); }
  void Set(const std::string& entry, const std::string& text) { Put(entry, {std::nullopt, text}); }
  /// All that was set, also what was the same before, in the order in which it was set.
  const std::vector<std::pair<std::string, Value>>& Changes() const { return m_arrChanges; }

 private:
  const Value* Find(const std::string& entry) const;
  void Put(const std::string& entry, const Value& value);

  std::map<std::string, Value> m_mapValues;
  std::vector<std::pair<std::string, Value>> m_arrChanges;
};

/// Sections by name; one that is asked for and missing is an empty one.
using CProfileSections = std::map<std::string, CProfileSection>;

/// The store of the player's choices: integers and strings by section and entry, which two running
/// games may share. Every call reads it anew.
///
/// What cannot be read counts as absent, what cannot be stored leaves the store as it was, and the
/// program goes on; a sentence says so on the error stream and to whoever takes the troubles. Where
/// another game holds the store, a call waits for it up to a second.
class CProfile {
 public:
  CProfile() = default;
  virtual ~CProfile() = default;
  CProfile(const CProfile&) = delete;
  CProfile& operator=(const CProfile&) = delete;

  /// All that is stored at this moment; nothing where it cannot be read. A store that cannot be
  /// understood is set aside by this, and empty then.
  virtual std::optional<CProfileSections> Read() = 0;

  using Change = std::function<void(CProfileSection&)>;
  /// Changes values of a section in one step: `change` is given the section as it is stored and
  /// sets what is to be stored; it does not use the profile itself. All of that is then on the disk
  /// or, when the program dies or this returns false, none of it; no other game comes between.
  /// Where the store cannot be read, `change` is not called at all.
  virtual bool Update(const std::string& section, const Change& change) = 0;

  /// Hands over what went wrong since the last time, as sentences for the player. The same one
  /// comes once only, until something can be stored again.
  std::vector<std::string> TakeTroubles();

 protected:
  void Tell(const std::string& trouble);
  void ForgetTold() { m_arrTold.clear(); }

 private:
  std::vector<std::string> m_arrTroubles;
  std::vector<std::string> m_arrTold;
};

/// Opens the profile that this machine keeps in, or under the name of, a file. Neither the file nor
/// its folder need exist. An empty path keeps nothing.
std::unique_ptr<CProfile> OpenProfile(const std::filesystem::path& file);

}  // namespace platform
