/* What a host that stands in for a phone offers besides the phone's own services: opening its
 * screen, saying how large it is, taking a picture of it, and telling that its window was closed.
 *
 * An application that is to run on a PC includes this header; one for the phone alone does not
 * need it. Calls are made from the application's thread.
 */
#pragma once

#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#endif
#pragma GCC visibility push(default)

/* Opens the screen as the environment asks: BRIMOL_DISPLAY=window|browser|headless (a window when
 * there is a display, headless otherwise; browser prints the address that browsers open),
 * BRIMOL_DEVICE=NAME of brimol/device.h (1440x2560 pixels at 489.5 dots per inch) and
 * BRIMOL_SCREEN=WIDTHxHEIGHT, which changes that size and leaves the density. EventInit does it for
 * an application that did not; EventQuit closes it. Opening an open screen is a success. Returns 1,
 * or 0 when it cannot be opened, and says why on stderr and in brimol_host_error(). */
int brimol_host_open(void);

/* One line without a line end about the call that failed last; empty when none did. The text stays
 * valid until the next call that fails. */
const char* brimol_host_error(void);

/* Stores the size of the open screen in pixels; what it would be where none is open. A null pointer
 * is skipped. */
void brimol_host_screen_size(int* width, int* height);

/* The dots per inch of the open screen, across and down; what they would be where none is open. */
float brimol_host_density(void);

/* The keys and mouse actions that the host understands, a line each, for an application's help. */
const char* brimol_host_help(void);

/* Non-zero once the user has asked to close the window. */
int brimol_host_close_requested(void);

/* Sets the screen's light in per cent, clamped to 0 to 100, from the next frame that ends; a screen
 * opens with 100. Screenshots show it too. Does nothing where no screen is open. */
void brimol_host_set_brightness(int percent);

/* Waits until the newest ended frame is painted and writes it as a PNG file in full size. Returns
 * 1, or 0 when there is no open screen or the file cannot be written; brimol_host_error() says why.
 */
int brimol_host_screenshot(const char* path);

/* What the world says. The real world answers, unless a session is recorded or played (see
 * docs/traces.md): a recording keeps the answers, and a played trace gives them, so that the same
 * run has the same results. Any thread. */

/* Milliseconds since 1970 in universal time. */
int64_t brimol_host_utc_ms(void);

/* A random number. */
uint32_t brimol_host_random(void);

/* Stores what the figure of that name is, such as a battery's charge: `real_value` as the
 * application has read it, or what the trace says instead, an empty text where it says nothing. The
 * text is cut at a whole UTF-8 character, so that it has room in `bytes` with its NUL. Returns the
 * length of the whole text in bytes. A null `name` or `real_value` is the empty text; a null
 * `value`, or `bytes` of less than 1, stores nothing. */
int brimol_host_figure(const char* name, const char* real_value, char* value, int bytes);

#pragma GCC visibility pop
#ifdef __cplusplus
}
#endif
