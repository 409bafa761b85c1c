/// What a viewer sends, cut into messages.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace brimol::pc {

/// Lets whole messages of the RFB protocol (RFC 6143) through to the VNC server, which would wait
/// for the rest of half a one, and no messages but those that a viewer of this screen needs.
class MessageGate {
 public:
  /// What fingers do; no other server knows it. Eight bytes: this number, what the finger does
  /// (FingerAction), its place across and down in pixels (two bytes each, the higher first), its
  /// number, 0 to 9, and a zero.
  static constexpr uint8_t kFingerMessage = 200;
  static constexpr std::size_t kFingerBytes = 8;

  /// Takes what arrived and appends to `whole` what is complete. False when it is no viewer's, and
  /// the connection has to end.
  bool take(std::string_view bytes, std::string& whole);

  /// The viewer's first message, its version of the protocol, has arrived.
  bool hasVersion() const { return stage != Stage::Version; }

 private:
  enum class Stage { Version, Security, Password, Start, Normal };
  std::size_t wantedBytes(std::string_view message) const;
  bool pass(std::string_view message, std::string& whole);

  Stage stage = Stage::Version;
  std::string partial;        // the message that is not complete
  std::size_t toSwallow = 0;  // bytes of a text for a clipboard that there is not
};

}  // namespace brimol::pc
