#pragma once

namespace brasel::devices::controlo {

// The control characters of the serial protocols of scales and indicators.
inline constexpr char STX = 2;
inline constexpr char ETX = 3;
inline constexpr char EOT = 4;
inline constexpr char ENQ = 5;
inline constexpr char ACK = 6;
inline constexpr char CR = 13;
inline constexpr char NAK = 21;
inline constexpr char ESC = 27;

}  // namespace brasel::devices::controlo
