#pragma once

#include <cstddef>
#include <cstdio>
#include <string>
#include <vector>

// In-memory INI store: sections of name=value entries, compared byte for byte
// (case-sensitive, no trimming) and kept in insertion order.
class CIniFile {
 public:
  // One section: entry j is names[j]=values[j].
  struct key {
    std::vector<std::string> values;
    std::vector<std::string> names;
  };

  // The longest line the loader keeps, in bytes; longer lines are left out.
  static constexpr std::size_t kLongestLine = 2047;

  CIniFile();
  virtual ~CIniFile();

  void SetFilePath(std::string path);
  bool Load();
  // False when the file could not be written; it is then left as it was.
  bool Save();
  // What Load takes from the file and what Save writes, without the file.
  void LoadFrom(std::FILE *file);
  std::string Serialize() const;

  std::string GetString(std::string section, std::string name);
  bool SetString(std::string section, std::string name, std::string value, bool create);
  bool SetInt(std::string section, std::string name, int number, bool create);

  int GetInt(std::string section, std::string name);
  double GetDouble(std::string section, std::string name);
  bool SetDouble(std::string section, std::string name, double number, bool create);
  bool DeleteEntry(std::string section, std::string name);
  bool DeleteSection(std::string section);
  int SectionCount() const;
  int EntryCount(std::string section) const;
  void Clear();

  int FindSection(const std::string &section) const;
  int FindEntry(int sectionIndex, const std::string &name) const;

  std::string m_path;
  std::vector<key> m_keys;           // one per section, in creation order
  std::vector<std::string> m_names;  // m_names[i] names m_keys[i]
  std::string m_error;               // last failure; never cleared, shown nowhere

 private:
  void ParseLine(const std::string &line, std::string &currentSection);
};
