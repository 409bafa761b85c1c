#include "remote/web_replies.h"

#include <array>
#include <vector>

namespace brimol::pc {

std::optional<std::string> header(lws* wsi, lws_token_indexes token) {
  constexpr int kLongest = 256;
  std::array<char, kLongest> text = {};
  const int length = websockets().hdrCopy(wsi, text.data(), kLongest, token);
  if (length <= 0) return std::nullopt;
  return std::string(text.data(), static_cast<std::size_t>(length));
}

int sendText(lws* wsi, const WebAnswer& answer) {
  constexpr std::size_t kHeadBytes = 2048;
  std::array<unsigned char, LWS_PRE + kHeadBytes> head = {};
  unsigned char* const start = head.data() + LWS_PRE;
  unsigned char* place = start;
  unsigned char* const end = head.data() + head.size();
  if (websockets().addHttpCommonHeaders(wsi, HTTP_STATUS_OK, answer.type, answer.text.size(),
                                        &place, end) != 0 ||
      websockets().finalizeWriteHttpHeader(wsi, start, &place, end) != 0) {
    return 1;
  }
  std::vector<unsigned char> body(LWS_PRE);
  body.insert(body.end(), answer.text.begin(), answer.text.end());
  const int sent =
      websockets().write(wsi, body.data() + LWS_PRE, answer.text.size(), LWS_WRITE_HTTP_FINAL);
  return sent < 0 || websockets().httpTransactionCompleted(wsi) != 0 ? 1 : 0;
}

int sendFile(lws* wsi, const WebAnswer& answer) {
  const int result = websockets().serveHttpFile(wsi, answer.file.c_str(), answer.type, nullptr, 0);
  return result < 0 || (result > 0 && websockets().httpTransactionCompleted(wsi) != 0) ? 1 : 0;
}

int refuse(lws* wsi, unsigned int status) {
  return websockets().returnHttpStatus(wsi, status, nullptr) != 0 ||
                 websockets().httpTransactionCompleted(wsi) != 0
             ? 1
             : 0;
}

}  // namespace brimol::pc
