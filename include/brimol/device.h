/* Screens of phones to try an application on: common ones of different age, oldest first.
 * BRIMOL_DEVICE=NAME in the environment opens the screen of that name. Any thread may ask.
 */
#pragma once

#ifdef __cplusplus
extern "C" {
#endif
#pragma GCC visibility push(default)

/* A phone's screen, held upright. */
typedef struct BrimolDevice {
  const char* name;  /* its class of resolution and its diagonal in inches: "wvga-4.0" */
  const char* title; /* a few words for people */
  int width;         /* pixels */
  int height;        /* pixels */
  float density;     /* dots per inch, across and down */
  int year;          /* when such screens were common */
} BrimolDevice;

/* All profiles, oldest first, as an array that lasts as long as the process. Stores how many there
 * are; a null pointer is skipped. */
const BrimolDevice* brimol_devices(int* count);

/* The profile of that name; null for any other text and for a null pointer. */
const BrimolDevice* brimol_device_named(const char* name);

#pragma GCC visibility pop
#ifdef __cplusplus
}
#endif
