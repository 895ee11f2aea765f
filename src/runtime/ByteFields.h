#pragma once

#include <concepts>
#include <cstddef>
#include <cstdint>
#include <span>

/// Fields of 16, 32 and 64 bits among bytes: of frames and files, and of the published records that cross the
/// seam to the machine as byte images. "Little" has the low byte first, "Big" the high one, as the network
/// has it.
///
/// Nothing is checked here: the caller has made sure that the whole field lies within the bytes, by a length
/// that it tested or by a size that it chose. Bytes that check themselves (platform::FrameBytes) are read by
/// their own helpers.
namespace quendra {

template <std::unsigned_integral Field>
constexpr Field LittleField(std::span<const std::uint8_t> bytes, std::size_t at) {
  Field value = 0;
  for (std::size_t i = 0; i < sizeof(Field); ++i)
    value = static_cast<Field>(value | static_cast<Field>(bytes[at + i]) << 8 * i);
  return value;
}

template <std::unsigned_integral Field>
constexpr Field BigField(std::span<const std::uint8_t> bytes, std::size_t at) {
  Field value = 0;
  for (std::size_t i = 0; i < sizeof(Field); ++i)
    value = static_cast<Field>(value | static_cast<Field>(bytes[at + i]) << 8 * (sizeof(Field) - 1 - i));
  return value;
}

template <std::unsigned_integral Field>
constexpr void PutLittleField(std::span<std::uint8_t> bytes, std::size_t at, Field value) {
  for (std::size_t i = 0; i < sizeof(Field); ++i) bytes[at + i] = static_cast<std::uint8_t>(value >> 8 * i);
}

template <std::unsigned_integral Field>
constexpr void PutBigField(std::span<std::uint8_t> bytes, std::size_t at, Field value) {
  for (std::size_t i = 0; i < sizeof(Field); ++i)
    bytes[at + i] = static_cast<std::uint8_t>(value >> 8 * (sizeof(Field) - 1 - i));
}

constexpr std::uint16_t Little16(std::span<const std::uint8_t> bytes, std::size_t at) {
  return LittleField<std::uint16_t>(bytes, at);
}
constexpr std::uint32_t Little32(std::span<const std::uint8_t> bytes, std::size_t at) {
  return LittleField<std::uint32_t>(bytes, at);
}
constexpr std::uint64_t Little64(std::span<const std::uint8_t> bytes, std::size_t at) {
  return LittleField<std::uint64_t>(bytes, at);
}
constexpr std::uint16_t Big16(std::span<const std::uint8_t> bytes, std::size_t at) {
  return BigField<std::uint16_t>(bytes, at);
}
constexpr std::uint32_t Big32(std::span<const std::uint8_t> bytes, std::size_t at) {
  return BigField<std::uint32_t>(bytes, at);
}
constexpr std::uint64_t Big64(std::span<const std::uint8_t> bytes, std::size_t at) {
  return BigField<std::uint64_t>(bytes, at);
}

constexpr void PutLittle16(std::span<std::uint8_t> bytes, std::size_t at, std::uint16_t value) {
  PutLittleField(bytes, at, value);
}
constexpr void PutLittle32(std::span<std::uint8_t> bytes, std::size_t at, std::uint32_t value) {
  PutLittleField(bytes, at, value);
}
constexpr void PutLittle64(std::span<std::uint8_t> bytes, std::size_t at, std::uint64_t value) {
  PutLittleField(bytes, at, value);
}
constexpr void PutBig16(std::span<std::uint8_t> bytes, std::size_t at, std::uint16_t value) {
  PutBigField(bytes, at, value);
}
constexpr void PutBig32(std::span<std::uint8_t> bytes, std::size_t at, std::uint32_t value) {
  PutBigField(bytes, at, value);
}
constexpr void PutBig64(std::span<std::uint8_t> bytes, std::size_t at, std::uint64_t value) {
  PutBigField(bytes, at, value);
}

} // namespace quendra
