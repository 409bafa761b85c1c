/* What c_api_test.c does with the entry points for C. */
#pragma once

#ifdef __cplusplus
extern "C" {
#endif

/* Adds a box to the display-item table. Its index, or the negative code. */
int addBoxFromC(int width);
/* 1 when raising the redraw flag by an application event works. */
int raiseFlagFromC(void);
/* 2 when raising the flag and taking it as an event works. */
int takeFlagFromC(void);
int isFirstFingerFromC(int type, unsigned int finger);

#ifdef __cplusplus
}
#endif
