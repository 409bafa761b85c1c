#pragma once

bool isNegative(int number);
int countBits(unsigned bits);
