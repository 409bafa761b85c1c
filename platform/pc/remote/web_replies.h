/// Answers to requests, and what the requests say, over libwebsockets.
#pragma once

#include <optional>
#include <string>

#include "remote/web_answers.h"
#include "remote/web_calls.h"

namespace brimol::pc {

/// A header of the request, of at most 255 characters.
std::optional<std::string> header(lws* wsi, lws_token_indexes token);

/// These answer a request. 0, or 1 where the connection has to end.
int sendText(lws* wsi, const WebAnswer& answer);
int sendFile(lws* wsi, const WebAnswer& answer);
int refuse(lws* wsi, unsigned int status);

}  // namespace brimol::pc
