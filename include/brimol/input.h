/* The input service of the platform: input records, the millisecond clock and its pauses. */
#pragma once

#include <stddef.h>
#include <stdint.h>

#ifdef __cplusplus
#define BRIMOL_STATIC_ASSERT static_assert
extern "C" {
#else
#define BRIMOL_STATIC_ASSERT _Static_assert
#endif
#pragma GCC visibility push(default)

/* The kind of an input record; the toolkit ignores any other value. */
enum BrimolEventType {
  BRIMOL_KEY_DOWN = 2,
  BRIMOL_KEY_UP = 3,
  BRIMOL_POINTER_MOTION = 4,
  BRIMOL_POINTER_DOWN = 5,
  BRIMOL_POINTER_UP = 6,
  BRIMOL_LONG_PRESS = 18,
  BRIMOL_USER_EVENT = 24
};

/* What the phone's keys report as their code. Other keys have other codes. */
enum BrimolKeyCode {
  BRIMOL_CODE_HOME = 102,
  BRIMOL_CODE_VOLUME_DOWN = 114,
  BRIMOL_CODE_VOLUME_UP = 115,
  BRIMOL_CODE_POWER = 116,
  BRIMOL_CODE_BACK = 158,
  BRIMOL_CODE_UP = 273,
  BRIMOL_CODE_DOWN = 274,
  BRIMOL_CODE_RIGHT = 275,
  BRIMOL_CODE_LEFT = 276,
  BRIMOL_CODE_HOOK = 323,
  BRIMOL_CODE_SELECT = 327
};

/* Types 4, 5, 6 and 18. Positions are in screen pixels. */
typedef struct BrimolPointerEvent {
  uint8_t type;     /* enum BrimolEventType */
  uint8_t reserved; /* not read */
  uint8_t finger;   /* 0 for the first finger */
  uint8_t state;    /* handed on to the application */
  uint16_t x;       /* from the left edge */
  uint16_t y;       /* from the top edge */
  int16_t xrel;     /* motion since the finger's previous record; type 4 only */
  int16_t yrel;     /* the same, downwards */
} BrimolPointerEvent;

/* Types 2 and 3. */
typedef struct BrimolKeyEvent {
  uint8_t type;       /* enum BrimolEventType */
  uint8_t reserved;   /* not read */
  uint8_t state;      /* handed on to the application */
  uint8_t reserved2;  /* not read */
  uint32_t reserved3; /* not read */
  uint32_t code;      /* enum BrimolKeyCode, or another */
} BrimolKeyEvent;

/* Type 24: two words whose meaning the sender and the receiver agree on. */
typedef struct BrimolUserEvent {
  uint8_t type;        /* enum BrimolEventType */
  uint8_t reserved[3]; /* not read */
  uint32_t word1;      /* a widget gets it as the second word, its key's code */
  uint32_t word2;      /* a widget gets it as the first word, its key's state */
} BrimolUserEvent;

enum { BRIMOL_EVENT_BYTES = 64 }; /* what an input record holds */

/* One input record. The toolkit reads its first 12 bytes, a platform may use those behind them. */
typedef union Event {
  uint8_t type;                      /* enum BrimolEventType; every form begins with it */
  BrimolPointerEvent pointer;        /* types 4, 5, 6 and 18 */
  BrimolKeyEvent key;                /* types 2 and 3 */
  BrimolUserEvent user;              /* type 24 */
  uint8_t bytes[BRIMOL_EVENT_BYTES]; /* all of it */
} Event;

BRIMOL_STATIC_ASSERT(sizeof(BrimolPointerEvent) == 12 && offsetof(BrimolPointerEvent, type) == 0 &&
                         offsetof(BrimolPointerEvent, finger) == 2 &&
                         offsetof(BrimolPointerEvent, state) == 3 &&
                         offsetof(BrimolPointerEvent, x) == 4 &&
                         offsetof(BrimolPointerEvent, y) == 6 &&
                         offsetof(BrimolPointerEvent, xrel) == 8 &&
                         offsetof(BrimolPointerEvent, yrel) == 10,
                     "BrimolPointerEvent");
BRIMOL_STATIC_ASSERT(sizeof(BrimolKeyEvent) == 12 && offsetof(BrimolKeyEvent, type) == 0 &&
                         offsetof(BrimolKeyEvent, state) == 2 &&
                         offsetof(BrimolKeyEvent, code) == 8,
                     "BrimolKeyEvent");
BRIMOL_STATIC_ASSERT(sizeof(BrimolUserEvent) == 12 && offsetof(BrimolUserEvent, type) == 0 &&
                         offsetof(BrimolUserEvent, word1) == 4 &&
                         offsetof(BrimolUserEvent, word2) == 8,
                     "BrimolUserEvent");
BRIMOL_STATIC_ASSERT(sizeof(Event) == BRIMOL_EVENT_BYTES && offsetof(Event, type) == 0 &&
                         offsetof(Event, pointer) == 0 && offsetof(Event, key) == 0 &&
                         offsetof(Event, user) == 0,
                     "Event");

/* The flags that the toolkit asks for. */
enum { BRIMOL_INPUT_FLAGS = 0x01000001 };

/* Starts the service; `flags` select what it reports. Non-zero on success. */
int EventInit(unsigned int flags);

/* Stops it. Records that nobody took are dropped. */
void EventQuit(void);

/* Fills `event` with the next record and returns non-zero, or returns 0 when none waits. Never
 * blocks. One thread polls. */
int PollEvent(Event* event);

/* Milliseconds since some fixed moment; wraps after 49.7 days. Any thread. */
unsigned int GetTicks(void);

/* Pauses the calling thread for about `ms` milliseconds. Input may end a pause early, so that it is
 * seen at once: on the polling thread when it arrives; on other threads, once the polling thread
 * has asked for the next record, pauses of up to 20 ms. While there is neither input nor drawing, a
 * pause of 1 ms may last up to 4. Any thread. */
void Delay(unsigned int ms);

#pragma GCC visibility pop
#ifdef __cplusplus
}
#endif
#undef BRIMOL_STATIC_ASSERT
