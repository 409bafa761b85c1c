/// Takes the text of a list of results apart.
#pragma once

#include <MW/mpd_wid.h>

#include <string_view>
#include <vector>

namespace MW {

/// What cal_line() reads of an application's text.
std::string_view mpdText(const char* lines, int length);

/// The first MpdWid::kItems lines; MpdWid::cal_line() says how they are read.
std::vector<MpdLine> parseMpdLines(std::string_view text);

/// A text in a line's field: cut to what it takes.
void putField(MpdLine::Field& field, std::string_view given);

}  // namespace MW
