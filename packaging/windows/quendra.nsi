; The installer of the Windows edition. Built by packaging/windows/build with the version and the folder of the program.
; It speaks Hebrew, from right to left; /S installs without a word. The capture library is not ours to hand on: the last
; page says where it comes from.

Unicode true
!include MUI2.nsh

Name "Quendra"
OutFile "${OUTPUT}"
InstallDir "$PROGRAMFILES\Quendra"
InstallDirRegKey HKLM "Software\Quendra" "Folder"
RequestExecutionLevel admin
SetCompressor /SOLID lzma
XPStyle on
BrandingText " "
ShowInstDetails nevershow
ShowUninstDetails nevershow

VIProductVersion "${VERSION}.0.0"
VIAddVersionKey /LANG=1037 "ProductName" "Quendra"
VIAddVersionKey /LANG=1037 "FileDescription" "התקנת Quendra"
VIAddVersionKey /LANG=1037 "CompanyName" "זלמר"
VIAddVersionKey /LANG=1037 "LegalCopyright" ""
VIAddVersionKey /LANG=1037 "FileVersion" "${VERSION}"

!define MUI_ICON "${ICON}"
!define MUI_UNICON "${ICON}"
!define MUI_ABORTWARNING
!define REMOVAL "Software\Microsoft\Windows\CurrentVersion\Uninstall\Quendra"

!insertmacro MUI_PAGE_DIRECTORY
!insertmacro MUI_PAGE_INSTFILES
!define MUI_WELCOMEFINISHPAGE_BITMAP "${SIDE}"
!define MUI_FINISHPAGE_TITLE "Quendra הותקנה"
!define MUI_FINISHPAGE_TEXT_LARGE
!define MUI_FINISHPAGE_TEXT "למדידת התעבורה דרושה ספריית לכידת מנות, שאינה חלק מהתקנה זו.$\r$\n\
$\r$\nWindows XP: WinPcap 4.1.3, www.winpcap.org$\r$\nWindows 7 ואילך: Npcap, npcap.com$\r$\n\
$\r$\nבלעדיה מוצגים התהליכים והיציאות שלהם בלבד."
!define MUI_FINISHPAGE_RUN
!define MUI_FINISHPAGE_RUN_FUNCTION StartForTheUser
!insertmacro MUI_PAGE_FINISH
!insertmacro MUI_UNPAGE_CONFIRM
!insertmacro MUI_UNPAGE_INSTFILES
!insertmacro MUI_LANGUAGE "Hebrew"

; One who runs the program must close it first: its file can't be written over or taken away. Status 2 says so to whoever
; asked for silence.
!macro RefuseWhileItRuns
  System::Call 'kernel32::OpenMutexW(i 0x100000, i 0, w "Local\QuendraRuns") p .r0 ?e'
  Pop $1
  ; Denied: another user's, whose rights we have taken the administrator's for.
  ${If} $0 P<> 0
  ${OrIf} $1 = 5
    System::Call 'kernel32::CloseHandle(p r0)'
    MessageBox MB_OK|MB_ICONEXCLAMATION|MB_RIGHT|MB_RTLREADING "יש לסגור את Quendra ולנסות שוב." /SD IDOK
    SetErrorLevel 2
    Quit
  ${EndIf}
!macroend

Function .onInit
  !insertmacro RefuseWhileItRuns
FunctionEnd

Function un.onInit
  !insertmacro RefuseWhileItRuns
FunctionEnd

; Status 3: a file or an entry of the registry can't be written, as for one who may not install programs.
!macro RefuseAfterErrors
  ${If} ${Errors}
    MessageBox MB_OK|MB_ICONSTOP|MB_RIGHT|MB_RTLREADING "ההתקנה נכשלה: אין אפשרות לכתוב אל $INSTDIR או אל רישום המערכת." /SD IDOK
    SetErrorLevel 3
    Abort
  ${EndIf}
!macroend

; By the desktop, with the rights and the settings of whoever sits there, and not with the administrator's that we have.
Function StartForTheUser
  Exec '"$WINDIR\explorer.exe" "$INSTDIR\quendra.exe"'
FunctionEnd

Section
  SetShellVarContext all
  SetOutPath "$INSTDIR"
  SetOverwrite try
  ClearErrors
  File "${PROGRAM}"
  !insertmacro RefuseAfterErrors
  WriteUninstaller "$INSTDIR\remove.exe"
  CreateShortcut "$SMPROGRAMS\Quendra.lnk" "$INSTDIR\quendra.exe"
  WriteRegStr HKLM "Software\Quendra" "Folder" "$INSTDIR"
  WriteRegStr HKLM "${REMOVAL}" "DisplayName" "Quendra"
  WriteRegStr HKLM "${REMOVAL}" "DisplayVersion" "${VERSION}"
  WriteRegStr HKLM "${REMOVAL}" "Publisher" "זלמר"
  WriteRegStr HKLM "${REMOVAL}" "DisplayIcon" "$INSTDIR\quendra.exe"
  WriteRegStr HKLM "${REMOVAL}" "UninstallString" '"$INSTDIR\remove.exe"'
  WriteRegStr HKLM "${REMOVAL}" "QuietUninstallString" '"$INSTDIR\remove.exe" /S'
  WriteRegDWORD HKLM "${REMOVAL}" "NoModify" 1
  WriteRegDWORD HKLM "${REMOVAL}" "NoRepair" 1
  !insertmacro RefuseAfterErrors
SectionEnd

Section Uninstall
  SetShellVarContext all
  ClearErrors
  Delete "$INSTDIR\quendra.exe"
  ${If} ${Errors}
    MessageBox MB_OK|MB_ICONSTOP|MB_RIGHT|MB_RTLREADING "ההסרה נכשלה: אין אפשרות למחוק מ-$INSTDIR." /SD IDOK
    SetErrorLevel 3
    Abort
  ${EndIf}
  Delete "$INSTDIR\remove.exe"
  ; Only when nothing of anybody else lies in it.
  RMDir "$INSTDIR"
  Delete "$SMPROGRAMS\Quendra.lnk"
  DeleteRegKey HKLM "${REMOVAL}"
  DeleteRegKey HKLM "Software\Quendra"
SectionEnd
