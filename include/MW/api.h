/// Marks what libbrimol3_widget.so exports.
#pragma once

#define MW_API __attribute__((visibility("default")))
