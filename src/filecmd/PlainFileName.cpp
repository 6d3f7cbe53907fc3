#include "filecmd/PlainFileName.h"

#include <algorithm>
#include <cctype>
#include <cstring>

namespace {
bool IsDeviceName(std::string base) {
  // The file system drops blanks before the extension: "con .dwg" is the console too.
  while (!base.empty() && base.back() == ' ') base.pop_back();
  std::transform(base.begin(), base.end(), base.begin(), [](unsigned char c) { return static_cast<char>(std::toupper(c)); });
  for (const char *device : {"CON", "PRN", "AUX", "NUL"})
    if (base == device) return true;
  return base.size() == 4 && (base.compare(0, 3, "COM") == 0 || base.compare(0, 3, "LPT") == 0) && base[3] >= '1' &&
         base[3] <= '9';
}
}  // namespace

NameRule CheckPlainFileName(const std::string &name) {
  if (name.empty()) return NameRule::Empty;
  if (name.find_first_of("\\/:") != std::string::npos) return NameRule::PathSeparator;
  for (const char c : name)
    if (static_cast<unsigned char>(c) < 0x20 || std::strchr("<>\"|?*", c)) return NameRule::ForbiddenCharacter;
  if (name.back() == '.' || name.back() == ' ') return NameRule::EndsWithDotOrSpace;
  if (IsDeviceName(name.substr(0, name.find('.')))) return NameRule::ReservedDevice;
  return NameRule::Plain;
}

std::string NameRuleText(NameRule rule) {
  switch (rule) {
    case NameRule::Plain: return std::string();
    case NameRule::Empty: return "The new name is empty.";
    case NameRule::PathSeparator: return "A new name is a file name in this folder: it cannot contain \\, / or :.";
    case NameRule::ForbiddenCharacter: return "A file name cannot contain control characters or any of < > \" | ? *.";
    case NameRule::EndsWithDotOrSpace: return "A file name cannot end with a dot or a space.";
    case NameRule::ReservedDevice:
      return "CON, PRN, AUX, NUL, COM1 to COM9 and LPT1 to LPT9 name devices, with any extension: they cannot name a file.";
  }
  return std::string();
}
