#include "app/Options.h"

#include <cwchar>

HostOptions ParseOptions(const std::vector<std::wstring> &args) {
  HostOptions options;
  for (size_t i = 0; i < args.size(); ++i) {
    const std::wstring &arg = args[i];
    const bool hasValue = i + 1 < args.size();
    if (arg == L"--batch") {
      options.batch = true;
    } else if (arg == L"--version") {
      options.version = true;
    } else if (arg == L"--eval" && hasValue) {
      options.evals.push_back(args[++i]);
    } else if (arg == L"--module" && hasValue) {
      options.modulePath = args[++i];
    } else if (arg == L"--layers" && hasValue) {
      options.layers = args[++i];
    } else if (arg == L"--drawings" && hasValue) {
      wchar_t *end = nullptr;
      const long count = std::wcstol(args[++i].c_str(), &end, 10);
      if (!end || *end || count < 0 || count > 64)
        options.error = L"--drawings takes a number from 0 to 64";
      else
        options.drawings = static_cast<int>(count);
    } else {
      options.error = L"unknown or incomplete option: " + arg;
    }
    if (!options.error.empty()) break;
  }
  return options;
}
