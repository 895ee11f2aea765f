#pragma once

#include "forms/WindowProcedures.h"
#include "platform/remote_access/RemoteAccessNumbers.h"
#include "provisioning/remote_access/RasDialParamsRecord.h"
#include "provisioning/remote_access/RasEntryRecord.h"
#include "runtime/Integers.h"

#include <functional>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace quendra::forms {
class Desktop;
}

namespace quendra::platform {
class Dialling;
class PhoneBook;
class System;
} // namespace quendra::platform

namespace quendra::provisioning {

/// The only one to speak to remote access: entries of the phone book, dials, and what a dial tells on its
/// way.
///
/// Texts that are taken by reference may get a NUL appended. A result of kTrue16 is success.
class mdlDun {
 public:
  struct RemoteAccess {
    platform::PhoneBook& phoneBook;
    platform::Dialling& dialling;
  };
  mdlDun(const RemoteAccess& remoteAccess, platform::System& system, forms::Desktop& desktop);
  /// A window that is still hooked goes on by its own procedure.
  ~mdlDun();
  mdlDun(const mdlDun&) = delete;
  mdlDun& operator=(const mdlDun&) = delete;

  // Dials.

  /// Always 0. With `asynchronous` and a window the outcome arrives as dial events, else nobody hears of it.
  std::int32_t DialEntry(std::int16_t asynchronous, Text& entryName, Text& phoneNumber, Text& userName,
                         Text& password, std::optional<WindowHandle> window = {});
  Boolean16 HangUpActive(Boolean16 showMessages);
  Boolean16 HangUpAllConnections();

  // The phone book.

  /// Empty when there is none.
  Text FindDeviceName(const Text& search, Boolean16 matchByType = kFalse16);
  Boolean16 EnumEntries(std::vector<Text>& names, std::int32_t& count, Text& phoneBook);
  Boolean16 DeleteEntry(Text& entryName, Text& phoneBook, Boolean16 show);
  Boolean16 GetEntryProperties(RasEntryRecord& record, Text& entryName, Text& phoneBook);
  Boolean16 SetEntryProperties(Text& entryName, const RasEntryRecord& record, RasDialParamsRecord& dialParams,
                               Text& phoneBook);
  /// The platform's result.
  std::uint32_t GetDialParamsBytes(std::vector<std::uint8_t>& image, Text& phoneBook, Text& entryName,
                                   Boolean16& hasPassword);
  /// The platform's result.
  std::uint32_t SetDialParamsBytes(Text& phoneBook, const std::vector<std::uint8_t>& image,
                                   Boolean16 removePassword);
  Boolean16 DialParamsFromBytes(const std::vector<std::uint8_t>& image, RasDialParamsRecord& record);
  Boolean16 DialParamsToBytes(const RasDialParamsRecord& record, std::vector<std::uint8_t>& image);

  /// kTrue16 for a failure that was told or could have been, 0 for none.
  Boolean16 ReportRasError(std::uint32_t number, const Text& call, Boolean16 show);
  Boolean16 GetOsVersion(std::int32_t& code, Text& version, Text& build);

  // What a dial tells.

  void HookDialEvents(WindowHandle window);
  void UnhookDialEvents(WindowHandle window);

  /// Hears of each change of a dial: the message, the state and the error number.
  std::function<void(std::uint32_t message, std::uint32_t state, std::uint32_t error)> OnDialEvent;

  platform::RasConnection ActiveRasConn;
  WindowHandle HookedWindow;
  forms::WindowProcedure PreviousWndProc;
  std::uint32_t RasDialEventMessage = 0;

 private:
  using Bytes = std::vector<std::uint8_t>;
  struct Hook;

  bool HasNamedPhoneBooks();
  /// The phone book as the platform takes it: a NUL behind it, and none but the user's own on a system that
  /// has no other.
  std::string PhoneBookOf(Text& phoneBook);

  std::uint32_t Dial(const Bytes& params, std::optional<WindowHandle> window);
  std::vector<platform::RasConnection> OpenConnections(bool& told);

  Boolean16 ListEntries(std::vector<Text>& names, std::int32_t& count, Text& phoneBook);
  void ListAll(Bytes block, const std::string& phoneBook, std::vector<Text>& names);
  std::uint32_t EntryRecordBytes(std::uint32_t& bytes);
  Boolean16 ReadEntry(RasEntryRecord& record, Text& entryName, Text& phoneBook);
  Boolean16 WriteEntry(const Text& entryName, const RasEntryRecord& record, RasDialParamsRecord& dialParams,
                       Text& phoneBook);
  Boolean16 SaveDialParams(const Text& entryName, RasDialParamsRecord& dialParams);
  bool AcceptsDialParamsOf(std::uint32_t bytes);

  Text RasErrorText(std::uint32_t result, std::span<const char> told) const;
  Text SystemErrorText(std::uint32_t number);
  void ShowExclamation(const Text& title, const Text& text);
  /// Runs an operation. A fault in it is told in a box behind these words and makes it fail.
  Boolean16 Trapping(const Text& words, const std::function<Boolean16()>& operation);

  std::int32_t DialEventWndProc(WindowHandle window, std::uint32_t message, std::uint32_t wParam,
                                std::uint32_t lParam);

  platform::PhoneBook& phoneBook_;
  platform::Dialling& dialling_;
  platform::System& system_;
  forms::Desktop& desktop_;
  std::shared_ptr<Hook> hook_;
  forms::WindowProcedure hookProcedure_;
};

/// The cleared record.
RasEntryRecord& ClearRasEntry(RasEntryRecord& record);

} // namespace quendra::provisioning
