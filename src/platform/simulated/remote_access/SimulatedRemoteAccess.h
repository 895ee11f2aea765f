#pragma once

#include "platform/remote_access/PhoneBook.h"
#include "platform/remote_access/RecordList.h"
#include "platform/simulated/SimulatedCore.h"
#include "platform/simulated/remote_access/EntryBook.h"
#include "platform/simulated/remote_access/RasRefusals.h"
#include "platform/simulated/remote_access/SimulatedDials.h"

#include <optional>
#include <set>

namespace quendra::platform::simulated {

/// A phone book, devices and dials, as a test scripts them. There is one phone book, by whatever name it is
/// asked for. What writes, deletes, dials or hangs up stands in the machine's Calls with the entry's name,
/// as in "RasDialA Home"; Count tells how often any operation was called.
///
/// Dials go through the loop that the machine was given, a step a round; without one a test takes the steps.
class SimulatedRemoteAccess : public PhoneBook, public Dialling {
 public:
  explicit SimulatedRemoteAccess(Core& core) : core_(core) {}

  void UseLoop(EventLoop& loop) { dials_.UseLoop(loop); }

  // The system. Sizes are set before entries are made.

  std::uint32_t EntryBytes = RasEntry::kBytes;
  std::vector<std::uint32_t> DialParamsSizes{RasDialParams::kBytes, RasDialParams::kBytesWithoutNumbers,
                                             RasDialParams::kBytesOfShortNames};
  std::vector<std::uint32_t> ConnectionSizes{
      RasConnectionRecord::kBytes, RasConnectionRecord::kBytesWithoutGuid,
      RasConnectionRecord::kBytesWithoutPhoneBook, RasConnectionRecord::kBytesOfShortNames};
  /// Texts of its own numbers. Others from 600 to 799 have a plain one.
  std::map<std::uint32_t, std::string> ErrorTexts{
      {kRasCannotFindPhonebookEntry, "The phone book entry was not found."},
      {kRasPortNotAvailable, "The port is in use or not ready."},
      {kRasNoAnswer, "There was no answer."},
      {kRasAuthenticationFailure, "The user name or the password was refused."},
      {kRasManagerCannotStart, "Remote access could not start."},
  };
  /// Without remote access every operation gives kRasManagerCannotStart.
  bool IsThere = true;
  /// From so many more calls on an operation gives the error, until it is allowed again.
  void Refuse(const std::string& operation, std::uint32_t error, int after = 0) {
    refusals_.Refuse(operation, error, after);
  }
  void Allow(const std::string& operation) { refusals_.Allow(operation); }
  int Count(const std::string& operation) const { return refusals_.Calls(operation); }
  /// The phone book that the last call of an operation named; nothing for nullptr.
  std::map<std::string, std::optional<std::string>> PhoneBookOf;

  // Devices and entries. Another program does this, too, between two calls of ours.

  struct Device {
    std::string type;
    std::string name;
  };
  std::vector<Device> Devices;
  /// The entry of that name, made if it isn't there.
  SimulatedEntry& AddEntry(const std::string& name) { return book_.Made(name, EntryBytes); }
  /// nullptr for a name that the phone book hasn't.
  SimulatedEntry* Entry(const std::string& name) { return book_.Find(name); }
  bool RemoveEntry(const std::string& name) { return book_.Remove(name); }
  std::vector<std::string> EntryNames() const;

  // Dials and connections.

  /// What the next dials of an entry go through. An entry without a script connects at once.
  DialScript& Dial(const std::string& entryName) { return dials_.Script(entryName); }
  /// A dial that rests goes on, or a connection drops.
  void GoOn(const std::string& entryName, const DialScript& more) { dials_.GoOn(entryName, more); }
  /// Without a loop: the next step of a dial. Nothing when there is none, and when it tells nobody.
  std::optional<DialEvent> Step() { return dials_.Step(); }
  /// A connection that another program has made.
  RasConnection Connect(const std::string& entryName);
  /// Another program ends the connections of that entry.
  void Disconnect(const std::string& entryName);
  const std::list<SimulatedConnection>& Connections() const { return dials_.Connections(); }

  struct DialRequest {
    std::vector<std::uint8_t> extensions{};
    std::vector<std::uint8_t> params{};
    Notifier notifier{};
  };
  /// What was handed to RasDialA.
  std::vector<DialRequest> Dials;

  // PhoneBook.

  std::uint32_t RasEnumEntriesA(const char* phoneBook, std::span<std::uint8_t> names, std::uint32_t& bytes,
                                std::uint32_t& count) override;
  std::uint32_t RasDeleteEntryA(const char* phoneBook, const char* entryName) override;
  std::uint32_t RasGetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                       std::span<std::uint8_t> entry, std::uint32_t& bytes) override;
  std::uint32_t RasSetEntryPropertiesA(const char* phoneBook, const char* entryName,
                                       std::span<const std::uint8_t> entry) override;
  std::uint32_t RasGetEntryDialParamsA(const char* phoneBook, std::span<std::uint8_t> params,
                                       bool& hasPassword) override;
  std::uint32_t RasSetEntryDialParamsA(const char* phoneBook, std::span<const std::uint8_t> params,
                                       bool removePassword) override;
  std::uint32_t RasEnumDevicesA(std::span<std::uint8_t> devices, std::uint32_t& bytes,
                                std::uint32_t& count) override;

  // Dialling.

  std::uint32_t RasDialA(std::span<const std::uint8_t> extensions, const char* phoneBook,
                         std::span<const std::uint8_t> params, const Notifier& notifier,
                         RasConnection& connection) override;
  std::uint32_t RasHangUpA(RasConnection connection) override;
  std::uint32_t RasEnumConnectionsA(std::span<std::uint8_t> connections, std::uint32_t& bytes,
                                    std::uint32_t& count) override;
  std::uint32_t RasGetErrorStringA(std::uint32_t error, std::span<char> text) override;

 private:
  /// Counts a call. 0 when it may go on.
  std::uint32_t Enter(const std::string& operation);
  std::uint32_t Enter(const std::string& operation, const char* phoneBook);
  /// 0 when a record of dial parameters has a size of this system's and is whole.
  std::uint32_t ErrorOfParams(std::span<const std::uint8_t> params) const;
  void Record(const std::string& operation, const std::string& name) {
    core_.calls.push_back(operation + " " + name);
  }

  Core& core_;
  RasRefusals refusals_;
  EntryBook book_;
  SimulatedDials dials_;
  std::set<RasConnection> hungUp_; ///< by this program
};

} // namespace quendra::platform::simulated
