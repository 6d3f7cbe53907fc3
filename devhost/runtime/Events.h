// The record of what the module asked the host to say or release, in order.
#pragma once

#include <string>

namespace devhost {
void RecordEvent(int kind, std::wstring text);
}
