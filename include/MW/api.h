/// Marks what libbrimol3_widget.so exports.
#pragma once

/// Stands before a class or function that the library exports.
#define MW_API __attribute__((visibility("default")))
