#pragma once

#include "runtime/Variant.h"

#include <optional>

namespace quendra::foundation {

/// The bytes that a value goes out as: numbers in the machine's order (boolean 2, byte 1, 16-bit integer 2,
/// 32-bit integer and single 4, double, date and currency 8), a text in the system's code page, bytes as they
/// are. Nothing for a value of any other type.
std::optional<ByteArray> BytesOf(const Variant& value);

/// The bytes that a kind of fixed size takes; 0 for texts and bytes.
std::size_t SizeOf(DataKind kind);

/// The value of a kind that bytes stand for; as many bytes as `SizeOf` says, any number for texts and bytes.
Variant ValueOf(DataKind kind, ByteArray bytes);

} // namespace quendra::foundation
