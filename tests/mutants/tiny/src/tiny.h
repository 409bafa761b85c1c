#pragma once

bool isHuge(int number);
bool isNegative(int number);
int countBits(unsigned bits);
