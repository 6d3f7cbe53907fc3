#include "settings/IniFile.h"

#include "settings/AtomicReplace.h"

#include <sys/stat.h>

#include <climits>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <utility>

namespace {
const char kOpenError[] = "Unable to open ini file.";
const char kNoSectionError[] = "Unable to locate specified key.";
const char kNoEntryError[] = "Unable to locate specified value.";

// A line must fit 2048 bytes with its terminator: 2047 characters at most.
const std::string::size_type kLineBudget = CIniFile::kLongestLine + 1;

struct FileCloser {
  void operator()(std::FILE *file) const { std::fclose(file); }
};
using FilePtr = std::unique_ptr<std::FILE, FileCloser>;

enum class LineRead { Line, End, TooLong };

// Passes over the rest of a line that is too long to keep, its line end included.
void SkipRestOfLine(std::FILE *file) {
  int c;
  while ((c = std::getc(file)) != EOF && c != '\n') {
  }
}

// Reads the next line without its line end. The file is opened in binary mode and a
// CR directly before the LF is dropped here, so Windows and Linux read alike. A line
// is taken as its bytes: an embedded NUL is kept like any other character. A line too
// long to keep is read to its end, so that the next read starts at the next line.
LineRead ReadLine(std::FILE *file, std::string &line) {
  line.clear();
  int c;
  while ((c = std::getc(file)) != EOF) {
    if (c == '\n') {
      if (!line.empty() && line.back() == '\r') line.pop_back();
      return line.size() < kLineBudget ? LineRead::Line : LineRead::TooLong;
    }
    // A full budget before the line end means 2048 characters or more, even if
    // the last byte turns out to be a CR before the LF.
    if (line.size() == kLineBudget) {
      SkipRestOfLine(file);
      return LineRead::TooLong;
    }
    line.push_back(static_cast<char>(c));
  }
  // A failed read must not pass a cut line off as a whole one.
  if (std::ferror(file) || line.empty()) return LineRead::End;
  return line.size() < kLineBudget ? LineRead::Line : LineRead::TooLong;
}

bool IsBlank(char c) { return c == ' ' || c == '\t' || c == '\n' || c == '\v' || c == '\f' || c == '\r'; }

// Decimal integer as atoi reads it, but saturating at the int range instead of
// overflowing.
int ParseInt(const std::string &text) {
  std::string::size_type i = 0;
  while (i < text.size() && IsBlank(text[i])) ++i;
  bool negative = false;
  if (i < text.size() && (text[i] == '+' || text[i] == '-')) {
    negative = text[i] == '-';
    ++i;
  }
  const long long limit = static_cast<long long>(INT_MAX) + 1;
  long long magnitude = 0;
  for (; i < text.size() && text[i] >= '0' && text[i] <= '9'; ++i) {
    magnitude = magnitude * 10 + (text[i] - '0');
    if (magnitude > limit) magnitude = limit;
  }
  if (negative) return static_cast<int>(-magnitude);
  return magnitude > INT_MAX ? INT_MAX : static_cast<int>(magnitude);
}
}  // namespace

CIniFile::CIniFile() = default;

CIniFile::~CIniFile() = default;

void CIniFile::SetFilePath(std::string path) { m_path = std::move(path); }

bool CIniFile::Load() {
  struct stat status;
  if (::stat(m_path.c_str(), &status) != 0) return false;

  // A folder cannot be read as a file (Linux would open it and fail on the first read).
  FilePtr file((status.st_mode & S_IFMT) == S_IFDIR ? nullptr : std::fopen(m_path.c_str(), "rb"));
  if (!file) {
    m_error = kOpenError;
    return false;
  }
  LoadFrom(file.get());
  return true;
}

void CIniFile::LoadFrom(std::FILE *file) {
  std::string currentSection;
  std::string line;
  line.reserve(kLineBudget);
  // A line too long to keep is left out, and the lines after it still count: a file edited
  // by hand loses no setting that follows such a line.
  for (LineRead read; (read = ReadLine(file, line)) != LineRead::End;)
    if (read == LineRead::Line) ParseLine(line, currentSection);
}

void CIniFile::ParseLine(const std::string &line, std::string &currentSection) {
  if (line.empty()) return;

  if (line.front() == '[' && line.back() == ']') {
    // Every leading "[" and trailing "]" goes: [[a]] names a, [] the empty name.
    const std::string::size_type first = line.find_first_not_of('[');
    const std::string::size_type last = line.find_last_not_of(']');
    currentSection = first <= last ? line.substr(first, last - first + 1) : std::string();
    return;
  }

  const std::string::size_type equals = line.find('=');
  if (equals == std::string::npos)
    SetString(currentSection, std::string(), line.substr(1), true);
  else
    SetString(currentSection, line.substr(0, equals), line.substr(equals + 1), true);
}

std::string CIniFile::Serialize() const {
  std::string text;
  for (std::size_t i = 0; i < m_keys.size(); ++i) {
    const key &section = m_keys[i];
    if (section.names.empty()) continue;
    text += '[';
    text += m_names[i];
    text += "]\r\n";
    for (std::size_t j = 0; j < section.names.size(); ++j) {
      text += section.names[j];
      text += '=';
      text += section.values[j];
      text += "\r\n";
    }
    text += "\r\n";
  }
  return text;
}

bool CIniFile::Save() {
  // Writing over the file in place would leave it cut short after a crash or on a
  // full disk. The content goes to a file beside it first and replaces the old one
  // only when it is complete on the disk; any failure leaves the old file as it was.
  const std::string content = Serialize();
  const std::string temporary = m_path + ".tmp";

  FilePtr file(std::fopen(temporary.c_str(), "wb"));
  if (!file) return false;

  bool complete = std::fwrite(content.data(), 1, content.size(), file.get()) == content.size();
  complete = std::fflush(file.get()) == 0 && complete;
  complete = complete && CommitFileToDisk(file.get());
  complete = std::fclose(file.release()) == 0 && complete;

  if (complete && ReplaceFileAtomically(temporary, m_path)) return true;
  std::remove(temporary.c_str());
  return false;
}

std::string CIniFile::GetString(std::string section, std::string name) {
  const int i = FindSection(section);
  const int j = FindEntry(i, name);
  if (i == -1) {
    m_error = kNoSectionError;
    return std::string();
  }
  if (j == -1) {
    m_error = kNoEntryError;
    return std::string();
  }
  return m_keys[i].values[j];
}

bool CIniFile::SetString(std::string section, std::string name, std::string value, bool create) {
  int i = FindSection(section);
  if (i == -1) {
    if (!create) return false;
    m_keys.emplace_back();
    m_names.push_back(std::move(section));
    i = static_cast<int>(m_keys.size()) - 1;
  }
  key &record = m_keys[i];
  int j = FindEntry(i, name);
  if (j == -1) {
    if (!create) return false;
    record.names.push_back(std::move(name));
    record.values.emplace_back();
    j = static_cast<int>(record.names.size()) - 1;
  }
  record.values[j] = std::move(value);
  return true;
}

bool CIniFile::SetInt(std::string section, std::string name, int number, bool create) {
  return SetString(std::move(section), std::move(name), std::to_string(number), create);
}

int CIniFile::GetInt(std::string section, std::string name) { return ParseInt(GetString(std::move(section), std::move(name))); }

double CIniFile::GetDouble(std::string section, std::string name) {
  return std::strtod(GetString(std::move(section), std::move(name)).c_str(), nullptr);
}

bool CIniFile::SetDouble(std::string section, std::string name, double number, bool create) {
  char text[64];
  std::snprintf(text, sizeof text, "%e", number);
  return SetString(std::move(section), std::move(name), text, create);
}

bool CIniFile::DeleteEntry(std::string section, std::string name) {
  const int i = FindSection(section);
  const int j = FindEntry(i, name);
  if (j == -1) return false;
  key &record = m_keys[i];
  record.names.erase(record.names.begin() + j);
  record.values.erase(record.values.begin() + j);
  return true;
}

bool CIniFile::DeleteSection(std::string section) {
  const int i = FindSection(section);
  if (i == -1) return false;
  m_keys.erase(m_keys.begin() + i);
  m_names.erase(m_names.begin() + i);
  return true;
}

int CIniFile::SectionCount() const { return static_cast<int>(m_keys.size()); }

int CIniFile::EntryCount(std::string section) const {
  const int i = FindSection(section);
  return i == -1 ? -1 : static_cast<int>(m_keys[i].names.size());
}

void CIniFile::Clear() {
  m_keys.clear();
  m_names.clear();
}

int CIniFile::FindSection(const std::string &section) const {
  for (std::size_t i = 0; i < m_names.size(); ++i) {
    if (m_names[i] == section) return static_cast<int>(i);
  }
  return -1;
}

int CIniFile::FindEntry(int sectionIndex, const std::string &name) const {
  if (sectionIndex < 0 || sectionIndex >= static_cast<int>(m_keys.size())) return -1;
  const std::vector<std::string> &names = m_keys[sectionIndex].names;
  for (std::size_t j = 0; j < names.size(); ++j) {
    if (names[j] == name) return static_cast<int>(j);
  }
  return -1;
}
