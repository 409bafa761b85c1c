/* The drawing service's frames: everything that is added between the two calls is one picture.
 *
 * Both calls and the drawing calls between them belong to one thread. They record and hand over;
 * neither waits for a pixel. Painting and presenting happen on the service's own thread, and a
 * frame that a newer one overtakes there is never painted.
 */
#pragma once

#ifdef __cplusplus
extern "C" {
#endif
#pragma GCC visibility push(default)

/* Starts an empty frame on the calling thread. A frame that was not ended is dropped. */
void skia_begin_frame_c(void);

/* Hands the frame over to be shown in place of the one before. Without a started frame: nothing. */
void skia_end_frame_c(void);

#pragma GCC visibility pop
#ifdef __cplusplus
}
#endif
