// Where the explorer state file lies: beside the module, named after it, extension "ini".
#pragma once

#include <string>

// Lumvex1.arx -> Lumvex1.ini in the same folder.
std::string ComposeStateFilePath(const std::string &modulePath);
