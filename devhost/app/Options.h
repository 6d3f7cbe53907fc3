// devhost.exe's command line.
#pragma once

#include <string>
#include <vector>

struct HostOptions {
  bool batch = false;
  bool version = false;  // --version: print the version and end
  std::vector<std::wstring> evals;
  std::wstring modulePath;  // empty: Lumvex1.arx beside the program
  int drawings = 1;
  std::wstring layers;  // layer table of every drawing, "0=7;WALLS=1"; empty: layer "0" in colour 7
  std::wstring error;  // non-empty when the command line could not be read
};

HostOptions ParseOptions(const std::vector<std::wstring> &args);
