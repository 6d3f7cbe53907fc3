// Width of the loading progress bar's fill, in pixels of its 50-pixel inside.
#pragma once

constexpr int kProgressFillMax = 50;

// With a total of 1 or more: done * 50 / total. Below 1 (no expected number): a curve that is 0
// for no children and approaches 50 as children are added. Always within 0 to 50.
int ProgressFillWidth(int total, int done);
