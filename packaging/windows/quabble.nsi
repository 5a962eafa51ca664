; The installer: for the user who runs it, in the user's own folders. /S installs without a question, /D=FOLDER last names
; another folder. scripts/package says what VERSION, ICON and OUTPUT are, and in which folder the LISTS of files lie.
Target amd64-unicode
ManifestDPIAware true
SetCompressor /SOLID lzma
SetDateSave off
RequestExecutionLevel user

!include MUI2.nsh

!define KEY "Software\Microsoft\Windows\CurrentVersion\Uninstall\Quabble"
Name "Quabble"
OutFile "${OUTPUT}"
InstallDir "$LOCALAPPDATA\Programs\Quabble"
InstallDirRegKey HKCU "${KEY}" "InstallLocation"
BrandingText "Quabble ${VERSION}"

VIProductVersion "${VERSION}.0.0"
VIFileVersion "${VERSION}.0.0"
VIAddVersionKey "ProductName" "Quabble"
VIAddVersionKey "ProductVersion" "${VERSION}"
VIAddVersionKey "FileDescription" "Quabble's installer"
VIAddVersionKey "FileVersion" "${VERSION}"
VIAddVersionKey "LegalCopyright" "Copyright (c) 2026 the Quabble authors"

!define MUI_ICON "${ICON}"
!define MUI_UNICON "${ICON}"
!define MUI_FINISHPAGE_RUN "$INSTDIR\quabble.exe"
!insertmacro MUI_PAGE_DIRECTORY
!insertmacro MUI_PAGE_INSTFILES
!insertmacro MUI_PAGE_FINISH
!insertmacro MUI_UNPAGE_CONFIRM
!insertmacro MUI_UNPAGE_INSTFILES
!insertmacro MUI_LANGUAGE "English"

; A program that runs can be neither replaced nor removed.
!macro WaitForEnd
  again:
    FindWindow $0 "Quabble"
    IntCmp $0 0 ended
    MessageBox MB_RETRYCANCEL|MB_ICONEXCLAMATION "Please close Quabble first." /SD IDCANCEL IDRETRY again
    SetErrorLevel 2
    Quit
  ended:
!macroend

Function .onInit
  !insertmacro WaitForEnd
FunctionEnd

Function un.onInit
  !insertmacro WaitForEnd
FunctionEnd

Section
  SetOutPath "$INSTDIR"
  !include "${LISTS}/install.nsh"
  WriteUninstaller "$INSTDIR\uninstall.exe"
  CreateShortcut "$SMPROGRAMS\Quabble.lnk" "$INSTDIR\quabble.exe"

  SectionGetSize 0 $0
  WriteRegDWORD HKCU "${KEY}" "EstimatedSize" $0
  WriteRegStr HKCU "${KEY}" "DisplayName" "Quabble"
  WriteRegStr HKCU "${KEY}" "DisplayVersion" "${VERSION}"
  WriteRegStr HKCU "${KEY}" "DisplayIcon" "$INSTDIR\quabble.exe"
  WriteRegStr HKCU "${KEY}" "Publisher" "Vorlane"
  WriteRegStr HKCU "${KEY}" "InstallLocation" "$INSTDIR"
  WriteRegStr HKCU "${KEY}" "UninstallString" '"$INSTDIR\uninstall.exe"'
  WriteRegStr HKCU "${KEY}" "QuietUninstallString" '"$INSTDIR\uninstall.exe" /S'
  WriteRegDWORD HKCU "${KEY}" "NoModify" 1
  WriteRegDWORD HKCU "${KEY}" "NoRepair" 1
SectionEnd

; The folder goes if nothing else lies in it. Scores stay unless the user wants them to go.
Section Uninstall
  !include "${LISTS}/remove.nsh"
  Delete "$INSTDIR\uninstall.exe"
  RMDir "$INSTDIR"
  Delete "$SMPROGRAMS\Quabble.lnk"
  DeleteRegKey HKCU "${KEY}"
  MessageBox MB_YESNO|MB_ICONQUESTION|MB_DEFBUTTON2 "Remove the high scores, the settings and the record of the last game, too?" /SD IDNO IDNO kept
  DeleteRegKey HKCU "Software\Vorlane\Quabble"
  DeleteRegKey /ifempty HKCU "Software\Vorlane"
  Delete "$LOCALAPPDATA\Quabble\last_game.visit"
  Delete "$LOCALAPPDATA\Quabble\last_game.new"
  RMDir "$LOCALAPPDATA\Quabble"
  kept:
SectionEnd
