#pragma once

#include "forms/controls/Controls.h"
#include "forms/controls/ListView.h"

namespace quendra::monitor {

/// The process table on its page: heading, meters, list, its images and the scratch picture that icons are
/// drawn in.
class TableControls {
  using Label = forms::Label;

 public:
  explicit TableControls(forms::Frame& page) : frameMain(page) {}

  /// The page that they stand on.
  forms::Frame& frameMain;
  Label main_Label4{frameMain, u"main_Label4"};
  Label main_Label2{frameMain, u"main_Label2"};
  Label main_lblUpload{frameMain, u"main_lblUpload"};
  Label main_lblUploadUnit{frameMain, u"main_lblUploadUnit"};
  Label main_Label3{frameMain, u"main_Label3"};
  Label main_lblDownload{frameMain, u"main_lblDownload"};
  Label main_lblDownloadUnit{frameMain, u"main_lblDownloadUnit"};
  forms::ListView main_ListView1{frameMain, u"main_ListView1"};
  forms::PictureBox main_Pic{frameMain, u"main_Pic"};
  forms::ImageList main_ImList{frameMain, u"main_ImList"};
  forms::ImageList main_headersIL{frameMain, u"main_headersIL"};
};

} // namespace quendra::monitor
