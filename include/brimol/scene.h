/* The drawing service of the platform: the records that it draws and the calls that add them.
 *
 * The toolkit draws nothing itself. Each call adds one display item to the frame that is being
 * recorded and returns its handle, a number that is at least 0, or a negative number when the item
 * was not taken. Records are passed by value, so nothing needs to outlive the call. Usable from C11
 * and C++.
 */
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

/* A rectangle in pixels. A point is inside when x <= px < x + w and y <= py < y + h. */
typedef struct SKIA_Rect {
  int32_t x;      /* left edge */
  int32_t y;      /* top edge */
  int32_t w;      /* width */
  int32_t h;      /* height */
  uint32_t color; /* 0xAARRGGBB, the fill where the rectangle is drawn as a box */
} SKIA_Rect;

/* A line between two points, in pixels. */
typedef struct SKIA_Point {
  int32_t x1;     /* one end */
  int32_t y1;     /* the same */
  int32_t x2;     /* the other end */
  int32_t y2;     /* the same */
  uint32_t color; /* 0xAARRGGBB */
  int32_t width;  /* thickness in pixels; of an arrow its direction */
} SKIA_Point;

enum { SKIA_TEXT_BYTES = 128 }; /* what a text record holds, its NUL included */

/* Where a text stands in its rectangle; any other code means left. */
enum SKIA_Align { SKIA_ALIGN_LEFT = 1, SKIA_ALIGN_RIGHT = 2, SKIA_ALIGN_CENTRE = 5 };

/* An arrow's direction, in its point record's `width`; any other number points left, too. */
enum SKIA_ArrowDirection { SKIA_ARROW_RIGHT = 0, SKIA_ARROW_LEFT = 1 };

/* A text of at most 127 bytes of UTF-8 and a NUL. */
typedef struct SKIA_Text {
  char text[SKIA_TEXT_BYTES]; /* the characters */
  int32_t string_len;         /* bytes of `text` that are drawn */
  uint32_t color;             /* 0xAARRGGBB */
  int32_t align;              /* enum SKIA_Align */
  int32_t size;               /* font size in pixels */
} SKIA_Text;

/* What an item record shows; each kind names the drawing call that adds the same picture. */
enum SKIA_ItemKind {
  SKIA_LABEL = 0,
  SKIA_TEXTBOX = 1,
  SKIA_BUTTONBOX = 2,
  SKIA_BOX = 3,
  SKIA_ROUNDBOX = 4,
  SKIA_STATICBOX = 5,
  SKIA_LINE = 6,
  SKIA_IMAGE = 7, /* the text names a picture file */
  SKIA_ROUNDTEXTBOX = 8,
  SKIA_ROUNDBUTTONBOX = 9,
  SKIA_ARROW = 10
};

/* A whole display item: its kind and the records that this kind reads. */
typedef struct SKIA_Item {
  int32_t kind;     /* enum SKIA_ItemKind */
  SKIA_Rect rect;   /* of all kinds but SKIA_LINE */
  SKIA_Point point; /* of SKIA_LINE and SKIA_ARROW */
  SKIA_Text text;   /* of the kinds that show a text or a picture */
} SKIA_Item;

/* Other languages and the platform rely on these layouts. */
BRIMOL_STATIC_ASSERT(sizeof(SKIA_Rect) == 20 && offsetof(SKIA_Rect, x) == 0 &&
                         offsetof(SKIA_Rect, y) == 4 && offsetof(SKIA_Rect, w) == 8 &&
                         offsetof(SKIA_Rect, h) == 12 && offsetof(SKIA_Rect, color) == 16,
                     "SKIA_Rect");
BRIMOL_STATIC_ASSERT(sizeof(SKIA_Point) == 24 && offsetof(SKIA_Point, x1) == 0 &&
                         offsetof(SKIA_Point, y1) == 4 && offsetof(SKIA_Point, x2) == 8 &&
                         offsetof(SKIA_Point, y2) == 12 && offsetof(SKIA_Point, color) == 16 &&
                         offsetof(SKIA_Point, width) == 20,
                     "SKIA_Point");
BRIMOL_STATIC_ASSERT(sizeof(SKIA_Text) == 144 && offsetof(SKIA_Text, text) == 0 &&
                         offsetof(SKIA_Text, string_len) == 128 &&
                         offsetof(SKIA_Text, color) == 132 && offsetof(SKIA_Text, align) == 136 &&
                         offsetof(SKIA_Text, size) == 140,
                     "SKIA_Text");
BRIMOL_STATIC_ASSERT(sizeof(SKIA_Item) == 192 && offsetof(SKIA_Item, kind) == 0 &&
                         offsetof(SKIA_Item, rect) == 4 && offsetof(SKIA_Item, point) == 24 &&
                         offsetof(SKIA_Item, text) == 48,
                     "SKIA_Item");

/* A rectangle of its colour; with round corners. */
int skia_add_box_c(SKIA_Rect rect);
int skia_add_roundbox_c(SKIA_Rect rect);
int skia_add_line_c(SKIA_Point line); /* a straight line */
/* A text in a rectangle that is not drawn. */
int skia_add_label_c(SKIA_Rect rect, SKIA_Text text);
/* A text on a rectangle of its colour; with round corners. */
int skia_add_textbox_c(SKIA_Rect rect, SKIA_Text text);
int skia_add_roundtextbox_c(SKIA_Rect rect, SKIA_Text text);
/* A button's face with its caption; with round corners. */
int skia_add_buttonbox_c(SKIA_Rect rect, SKIA_Text text);
int skia_add_roundbuttonbox_c(SKIA_Rect rect, SKIA_Text text);
int skia_add_staticbox_c(SKIA_Rect rect, SKIA_Text text); /* a text on a box that is no button */
/* An arrow within the rectangle, in the point record's colour. The record's `width` says where it
 * points: enum SKIA_ArrowDirection. */
int skia_add_arrow_c(SKIA_Rect rect, SKIA_Point direction);
/* The item is copied. A null pointer or an unknown kind adds nothing and returns a negative number.
 */
int skia_add_widget_c(const SKIA_Item* item);

/* Non-zero while the display accepts input; 0, for instance, while it is dark. */
int skia_live_widget_c(void);

#pragma GCC visibility pop
#ifdef __cplusplus
}
#endif
#undef BRIMOL_STATIC_ASSERT
