#include "runtime/Fault.h"

#include <algorithm>
#include <array>

namespace quendra {

namespace {

struct Description {
  int number;
  const char16_t* text;
};

constexpr std::array<Description, 17> kDescriptions{{
    {Fault::kInvalidCall, u"Invalid procedure call or argument"},
    {Fault::kOverflow, u"Overflow"},
    {Fault::kOutOfMemory, u"Out of memory"},
    {Fault::kSubscript, u"Subscript out of range"},
    {Fault::kDivision, u"Division by zero"},
    {Fault::kTypeMismatch, u"Type mismatch"},
    {Fault::kOutOfStackSpace, u"Out of stack space"},
    {Fault::kFileNotFound, u"File not found"},
    {Fault::kDiskFull, u"Disk full"},
    {Fault::kPermissionDenied, u"Permission denied"},
    {Fault::kPathFileAccess, u"Path/File access error"},
    {Fault::kPathNotFound, u"Path not found"},
    {Fault::kObjectNotSet, u"Object variable or With block variable not set"},
    {Fault::kInvalidPropertyValue, u"Invalid property value"},
    {Fault::kCannotCreateObject, u"ActiveX component can't create object"},
    {Fault::kDuplicateKey, u"This key is already associated with an element of this collection"},
    {Fault::kNoSuchElement, u"Element not found"},
}};

Text DescriptionOf(int number) {
  const auto found = std::find_if(kDescriptions.begin(), kDescriptions.end(),
                                  [&](const Description& row) { return row.number == number; });
  return found == kDescriptions.end() ? u"Application-defined or object-defined error" : found->text;
}

} // namespace

Fault::Fault(int number) : Fault(number, DescriptionOf(number), {}) {}

Fault::Fault(int number_, Text description_, Text source_)
    : number(number_), description(std::move(description_)), source(std::move(source_)),
      what_("fault " + std::to_string(number) + ": " + ToUtf8(description)) {}

} // namespace quendra
