#pragma once

// All kinds of controls, for those who lay them out.
#include "forms/controls/ComboBox.h"
#include "forms/controls/CommandButton.h"
#include "forms/controls/Frame.h"
#include "forms/controls/Image.h"
#include "forms/controls/ImageList.h"
#include "forms/controls/Label.h"
#include "forms/controls/Line.h"
#include "forms/controls/ListBox.h"
#include "forms/controls/ListView.h"
#include "forms/controls/PictureBox.h"
#include "forms/controls/TextBox.h"
#include "forms/controls/Timer.h"
