#include "forms/win32/drawing/Fonts.h"

#include "forms/win32/drawing/Resources.h"

#include <algorithm>
#include <cmath>

namespace quendra::forms::win32 {

namespace {

constexpr double kPointsToTheInch = 72;
constexpr double kTwipsToTheInch = 1440;

/// Those that systems since XP show Hebrew with, the one made for small letters on screens first.
constexpr const char16_t* kFamilies[] = {u"Tahoma", u"Segoe UI", u"Arial", u"Microsoft Sans Serif"};
constexpr char16_t kOwnFamily[] = u"Quendra Sans";
constexpr const char* kOwnFiles[] = {"QuendraSans-Regular.ttf", "QuendraSans-Bold.ttf"};

HFONT MakeFont(const Text& family, int height, bool bold, bool underlined) {
  return ::CreateFontW(-height, 0, 0, 0, bold ? FW_BOLD : FW_NORMAL, FALSE, underlined, FALSE,
                       DEFAULT_CHARSET, OUT_DEFAULT_PRECIS, CLIP_DEFAULT_PRECIS, DEFAULT_QUALITY,
                       VARIABLE_PITCH | FF_SWISS, winapi::Wide(family));
}

/// A device context with a font in it.
class FontDc {
 public:
  explicit FontDc(HFONT font) : before_(::SelectObject(dc_, font)) {}
  ~FontDc() {
    ::SelectObject(dc_, before_);
    ::DeleteDC(dc_);
  }
  FontDc(const FontDc&) = delete;
  FontDc& operator=(const FontDc&) = delete;
  HDC Dc() const { return dc_; }

 private:
  HDC dc_ = ::CreateCompatibleDC(nullptr);
  HGDIOBJ before_;
};

/// The system gives another family where it has none of the name.
bool IsOfFamily(HDC dc, const Text& family) {
  wchar_t name[LF_FACESIZE] = {};
  ::GetTextFaceW(dc, LF_FACESIZE, name);
  return winapi::TextOf(name) == family;
}

bool HasSigns(HDC dc, const Text& signs) {
  std::vector<WORD> glyphs(signs.size());
  const DWORD count = ::GetGlyphIndicesW(dc, winapi::Wide(signs), static_cast<int>(signs.size()),
                                         glyphs.data(), GGI_MARK_NONEXISTING_GLYPHS);
  return count == signs.size() && std::find(glyphs.begin(), glyphs.end(), 0xFFFF) == glyphs.end();
}

int HeightOf(HFONT font) {
  const FontDc dc(font);
  TEXTMETRICW metrics{};
  ::GetTextMetricsW(dc.Dc(), &metrics);
  return metrics.tmHeight;
}

} // namespace

bool ShowsHebrewAndLatin(const Text& family) {
  const HFONT font = MakeFont(family, 12, false, false);
  bool shows = false;
  {
    const FontDc dc(font);
    shows = IsOfFamily(dc.Dc(), family) && HasSigns(dc.Dc(), u"אבגדהוזחטיךכלםמןנסעףפץצקרשתAZaz09.:/\\@");
  }
  ::DeleteObject(font);
  return shows;
}

int Fonts::LineHeight(HFONT font) const {
  const auto own = heights_.find(font);
  return own != heights_.end() ? own->second : HeightOf(font);
}

Fonts::Fonts() {
  const auto* const found = std::find_if(std::begin(kFamilies), std::end(kFamilies), ShowsHebrewAndLatin);
  family_ = found != std::end(kFamilies) ? *found : kOwnFamily;
  if (family_ == kOwnFamily) AddOwnFamily();
}

Fonts::~Fonts() {
  for (const auto& [key, font] : fonts_) ::DeleteObject(font);
  for (const HANDLE font : ownFonts_) ::RemoveFontMemResourceEx(font);
}

void Fonts::AddOwnFamily() {
  for (const char* file : kOwnFiles) {
    const auto bytes = ResourceOf(file);
    DWORD count = 0;
    const HANDLE font = ::AddFontMemResourceEx(const_cast<std::uint8_t*>(bytes.data()),
                                               static_cast<DWORD>(bytes.size()), nullptr, &count);
    if (font) ownFonts_.push_back(font);
  }
}

HFONT Fonts::FontOf(const Font& font, const Scale& scale) {
  const double dots = kTwipsToTheInch / scale.Unzoomed().twipsPerPixelY;
  const int height =
      std::max(1, static_cast<int>(std::lround(scale.Points(font.size) * dots / kPointsToTheInch)));
  HFONT& made = fonts_[{height, font.bold, font.underline}];
  if (made) return made;
  made = MakeFont(family_, height, font.bold, font.underline);
  heights_[made] = HeightOf(made);
  return made;
}

} // namespace quendra::forms::win32
