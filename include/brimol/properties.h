/* The system properties: short texts by name. Any thread. */
#pragma once

#ifdef __cplusplus
extern "C" {
#endif
#pragma GCC visibility push(default)

enum { BRIMOL_PROPERTY_BYTES = 92 }; /* room that a value needs, its NUL included */

/* Copies the value of `key`, or `default_value` where it is not set (null: empty), to `value`,
 * which has room for 92 bytes. Returns the value's length. */
int property_get(const char* key, char* value, const char* default_value);

/* Sets `key` to `value`. Returns 0, or -1 for a null or empty key or a value of over 91 bytes. */
int property_set(const char* key, const char* value);

#pragma GCC visibility pop
#ifdef __cplusplus
}
#endif
