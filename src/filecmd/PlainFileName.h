// What a rename may take: one plain file name in the drawing's own folder. A path in the new
// name would move the drawing elsewhere; the file system rejects some names and silently
// changes others. Each refusal names its rule so that the user can type a better name.
#pragma once

#include <string>

enum class NameRule {
  Plain,  // a file name the rename may take
  Empty,
  PathSeparator,       // \ / or :
  ForbiddenCharacter,  // a control character or one of < > " | ? *
  EndsWithDotOrSpace,
  ReservedDevice,  // CON, PRN, AUX, NUL, COM1-COM9, LPT1-LPT9, with any extension
};

// The first rule the name breaks, in the order above; Plain when it breaks none.
NameRule CheckPlainFileName(const std::string &name);

// One sentence that names the rule; empty for Plain.
std::string NameRuleText(NameRule rule);
