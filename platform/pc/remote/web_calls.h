/// libwebsockets' functions, in a library that is opened for browsers alone.
#pragma once

#include <libwebsockets.h>

#include "libraries/on_demand.h"

namespace brimol::pc {

struct WebCalls {
  explicit WebCalls(const char* file) : library(file) {}

  OnDemand library;

  decltype(&lws_add_http_common_headers) addHttpCommonHeaders =
      library.function("lws_add_http_common_headers");
  decltype(&lws_adopt_descriptor_vhost) adoptDescriptorVhost =
      library.function("lws_adopt_descriptor_vhost");
  decltype(&lws_callback_http_dummy) callbackHttpDummy =
      library.function("lws_callback_http_dummy");
  decltype(&lws_callback_on_writable) callbackOnWritable =
      library.function("lws_callback_on_writable");
  decltype(&lws_cancel_service) cancelService = library.function("lws_cancel_service");
  decltype(&lws_context_destroy) contextDestroy = library.function("lws_context_destroy");
  decltype(&lws_context_user) contextUser = library.function("lws_context_user");
  decltype(&lws_create_context) createContext = library.function("lws_create_context");
  decltype(&lws_create_vhost) createVhost = library.function("lws_create_vhost");
  decltype(&lws_finalize_write_http_header) finalizeWriteHttpHeader =
      library.function("lws_finalize_write_http_header");
  decltype(&lws_get_context) getContext = library.function("lws_get_context");
  decltype(&lws_get_socket_fd) getSocketFd = library.function("lws_get_socket_fd");
  decltype(&lws_hdr_copy) hdrCopy = library.function("lws_hdr_copy");
  decltype(&lws_http_transaction_completed) httpTransactionCompleted =
      library.function("lws_http_transaction_completed");
  decltype(&lws_return_http_status) returnHttpStatus = library.function("lws_return_http_status");
  decltype(&lws_rx_flow_control) rxFlowControl = library.function("lws_rx_flow_control");
  decltype(&lws_serve_http_file) serveHttpFile = library.function("lws_serve_http_file");
  decltype(&lws_service) service = library.function("lws_service");
  decltype(&lws_set_log_level) setLogLevel = library.function("lws_set_log_level");
  decltype(&lws_set_timeout) setTimeout = library.function("lws_set_timeout");
  decltype(&lws_set_timer_usecs) setTimerUsecs = library.function("lws_set_timer_usecs");
  decltype(&lws_write) write = library.function("lws_write");
};

/// Opens the library when it is first called. Where that has an error, nothing of it may be used.
const WebCalls& websockets();

}  // namespace brimol::pc
