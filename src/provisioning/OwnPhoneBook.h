#pragma once

#include "provisioning/remote_access/mdlDun.h"

namespace quendra::provisioning {

/// The user's own phone book, by entries' names. What may be appended to a name on its way is appended to a
/// copy.
class OwnPhoneBook {
 public:
  explicit OwnPhoneBook(mdlDun& dun) : dun_(dun) {}

  /// False after a box that says why.
  bool Get(Text name, RasEntryRecord& record);
  /// False after a box that says why. Blanks in the parameters' texts become NULs.
  bool Set(Text name, const RasEntryRecord& record, RasDialParamsRecord& dialParams);
  /// A failure is told in a box where `show` says so.
  void Delete(Text name, Boolean16 show);
  /// Empty where they can't be read.
  RasDialParamsRecord DialParamsOf(Text name);

 private:
  mdlDun& dun_;
};

} // namespace quendra::provisioning
