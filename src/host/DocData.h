// The per-drawing record of the data manager: nothing is kept per drawing yet.
#pragma once

struct CDocData {};
