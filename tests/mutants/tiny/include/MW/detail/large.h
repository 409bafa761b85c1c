#pragma once

inline bool isLarge(int number) { return number > 100; }
