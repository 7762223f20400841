/* The records' layout as C sees it, checked while this compiles; record_layout_test.cpp checks it as C++. */
#include "record_layout.h"
