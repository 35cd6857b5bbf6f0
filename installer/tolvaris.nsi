; The installer: for one user, without administrator's rights. scripts/pack gives it its definitions:
;   VERSAO       the version, "2.0.0"
;   ARQUIVOS     the directory with what is installed
;   RAIZ         the project's directory
;   INSTALADOR   the file to make
; Silently: tolvaris-VERSAO-setup.exe /S [/INGLES] [/TVK] [/D=DIRECTORY]; /INGLES puts the English texts too, /TVK the
; keeper's tool.
Target amd64-unicode
!include MUI2.nsh
!include FileFunc.nsh
!include LogicLib.nsh

!define CHAVE "Software\Microsoft\Windows\CurrentVersion\Uninstall\Tolvaris"
!define AJUSTES "Software\Roms\Tolvaris"
!define ATALHO "$SMPROGRAMS\Tolvaris.lnk"
!define DESINSTALADOR "$INSTDIR\desinstalar.exe"

Name "Tolvaris"
OutFile "${INSTALADOR}"
RequestExecutionLevel user
InstallDir "$LOCALAPPDATA\Programs\Tolvaris"
InstallDirRegKey HKCU "${CHAVE}" "InstallLocation"
SetCompressor /SOLID lzma
ManifestDPIAware true
BrandingText "Tolvaris ${VERSAO}"

VIProductVersion "${VERSAO}.0"
VIAddVersionKey /LANG=1046 "ProductName" "Tolvaris"
VIAddVersionKey /LANG=1046 "ProductVersion" "${VERSAO}"
VIAddVersionKey /LANG=1046 "FileDescription" "Tolvaris: instalação"
VIAddVersionKey /LANG=1046 "FileVersion" "${VERSAO}"
VIAddVersionKey /LANG=1046 "LegalCopyright" ""

!define MUI_ICON "${RAIZ}/resources/programa.ico"
!define MUI_UNICON "${RAIZ}/resources/programa.ico"
!define MUI_WELCOMEFINISHPAGE_BITMAP "${RAIZ}/resources/instalador.bmp"
!define MUI_ABORTWARNING
!define MUI_COMPONENTSPAGE_SMALLDESC
!define MUI_FINISHPAGE_RUN "$INSTDIR\tolvaris.exe"
!insertmacro MUI_PAGE_COMPONENTS
!insertmacro MUI_PAGE_DIRECTORY
!insertmacro MUI_PAGE_INSTFILES
!insertmacro MUI_PAGE_FINISH
!insertmacro MUI_UNPAGE_CONFIRM
!insertmacro MUI_UNPAGE_INSTFILES

; The first is shown to users of all other languages.
!insertmacro MUI_LANGUAGE "PortugueseBR"
!insertmacro MUI_LANGUAGE "English"

!macro TEXTO NOME PORTUGUES INGLES
  LangString ${NOME} ${LANG_PORTUGUESEBR} "${PORTUGUES}"
  LangString ${NOME} ${LANG_ENGLISH} "${INGLES}"
!macroend
!insertmacro TEXTO PROGRAMA "Tolvaris" "Tolvaris"
!insertmacro TEXTO SOBRE_PROGRAMA "O menu de jogos, o programa de auto-configuração e o guia." \
  "The game menu, the automatic configuration program and the guide."
!insertmacro TEXTO INGLES "Textos em inglês (language.ini)" "English interface (language.ini)"
!insertmacro TEXTO SOBRE_INGLES "O Tolvaris em inglês. Sem isto ele fala português." \
  "Tolvaris in English. Without this it speaks Portuguese."
!insertmacro TEXTO TVK "Ferramenta tvk (para quem guarda uma coleção)" "The tool tvk (for those who keep a collection)"
!insertmacro TEXTO SOBRE_TVK "Faz pacotes de jogos, confere e renomeia, no Prompt de Comando. Quem só joga não precisa." \
  "Packs games, checks and renames them, at the command prompt. Who only plays does not need it."
!insertmacro TEXTO ABERTO "O Tolvaris está aberto. Feche-o e tente de novo." \
  "Tolvaris is open. Close it and try again."
!insertmacro TEXTO PROTEGIDO \
  "Este arquivo está protegido contra gravação. Tire a proteção, nas propriedades dele, e tente de novo." \
  "This file is write-protected. Take the protection away, in its properties, and try again."
!insertmacro TEXTO APAGAR_AJUSTES \
  "Apagar também as configurações do Tolvaris ?$\r$\n$\r$\nOs jogos, as figuras, os salvamentos e o catálogo ficam." \
  "Delete the settings of Tolvaris too?$\r$\n$\r$\nThe games, pictures, saves and the catalogue stay."

; A program that runs can be neither replaced nor deleted, nor can one that is write-protected. Nothing else has been
; touched when the person gives up.
!macro ESPERAR_LIVRE ARQUIVO
  ${DoWhile} ${FileExists} "${ARQUIVO}"
    ${GetFileAttributes} "${ARQUIVO}" "READONLY" $0
    ${If} $0 == 1
      StrCpy $1 "$(PROTEGIDO)$\r$\n$\r$\n${ARQUIVO}"
    ${Else}
      StrCpy $1 "$(ABERTO)"
      ClearErrors
      FileOpen $0 "${ARQUIVO}" a
      ${IfNot} ${Errors}
        FileClose $0
        ${ExitDo}
      ${EndIf}
    ${EndIf}
    ${If} ${Cmd} `MessageBox MB_RETRYCANCEL|MB_ICONEXCLAMATION "$1" /SD IDCANCEL IDCANCEL`
      Abort "$1"
    ${EndIf}
  ${Loop}
!macroend
!macro ESPERAR_PROGRAMAS_LIVRES
  !insertmacro ESPERAR_LIVRE "$INSTDIR\tolvaris.exe"
  !insertmacro ESPERAR_LIVRE "$INSTDIR\tolvariscfg.exe"
  !insertmacro ESPERAR_LIVRE "$INSTDIR\tvk.exe"
!macroend

; A translation that we did not install is the user's.
!macro APAGAR_NOSSA_TRADUCAO
  ReadRegDWORD $0 HKCU "${CHAVE}" "Ingles"
  ${If} $0 == 1
    Delete "$INSTDIR\language.ini"
  ${EndIf}
!macroend

; It goes, and is put again where it is wanted.
!macro APAGAR_TVK
  Delete "$INSTDIR\tvk.exe"
  Delete "$INSTDIR\LEIAME-tvk.txt"
!macroend

Section "$(PROGRAMA)" SECAO_PROGRAMA
  SectionIn RO
  SetOutPath "$INSTDIR"
  !insertmacro ESPERAR_PROGRAMAS_LIVRES
  !insertmacro APAGAR_NOSSA_TRADUCAO
  !insertmacro APAGAR_TVK
  File "${ARQUIVOS}/tolvaris.exe"
  File "${ARQUIVOS}/tolvariscfg.exe"
  File "${ARQUIVOS}/LEIAME.txt"
  File "${ARQUIVOS}/CHANGELOG.txt"
  WriteUninstaller "${DESINSTALADOR}"
  CreateShortcut "${ATALHO}" "$INSTDIR\tolvaris.exe"

  WriteRegStr HKCU "${CHAVE}" "DisplayName" "Tolvaris"
  WriteRegStr HKCU "${CHAVE}" "DisplayVersion" "${VERSAO}"
  WriteRegStr HKCU "${CHAVE}" "Publisher" "Tolvaris"
  WriteRegStr HKCU "${CHAVE}" "DisplayIcon" "$INSTDIR\tolvaris.exe"
  WriteRegStr HKCU "${CHAVE}" "InstallLocation" "$INSTDIR"
  WriteRegStr HKCU "${CHAVE}" "UninstallString" '"${DESINSTALADOR}"'
  WriteRegStr HKCU "${CHAVE}" "QuietUninstallString" '"${DESINSTALADOR}" /S'
  WriteRegDWORD HKCU "${CHAVE}" "NoModify" 1
  WriteRegDWORD HKCU "${CHAVE}" "NoRepair" 1
  WriteRegDWORD HKCU "${CHAVE}" "Ingles" 0
  SectionGetSize ${SECAO_PROGRAMA} $0
  WriteRegDWORD HKCU "${CHAVE}" "EstimatedSize" $0
SectionEnd

; A translation of the user's own is kept under another name.
Section /o "$(INGLES)" SECAO_INGLES
  ${If} ${FileExists} "$INSTDIR\language.ini"
    StrCpy $0 1
    ${DoWhile} ${FileExists} "$INSTDIR\language.antes$0.ini"
      IntOp $0 $0 + 1
    ${Loop}
    Rename "$INSTDIR\language.ini" "$INSTDIR\language.antes$0.ini"
  ${EndIf}
  File "${ARQUIVOS}/translation/language.ini"
  WriteRegDWORD HKCU "${CHAVE}" "Ingles" 1
SectionEnd

Section /o "$(TVK)" SECAO_TVK
  File "${ARQUIVOS}/tvk.exe"
  File "${ARQUIVOS}/LEIAME-tvk.txt"
SectionEnd

!insertmacro MUI_FUNCTION_DESCRIPTION_BEGIN
  !insertmacro MUI_DESCRIPTION_TEXT ${SECAO_PROGRAMA} "$(SOBRE_PROGRAMA)"
  !insertmacro MUI_DESCRIPTION_TEXT ${SECAO_TVK} "$(SOBRE_TVK)"
  !insertmacro MUI_DESCRIPTION_TEXT ${SECAO_INGLES} "$(SOBRE_INGLES)"
!insertmacro MUI_FUNCTION_DESCRIPTION_END

; Who installed the English texts or the tool before, or asks for them on the command line, gets them.
Function .onInit
  ReadRegDWORD $0 HKCU "${CHAVE}" "Ingles"
  ${GetParameters} $1
  ClearErrors
  ${GetOptions} $1 "/INGLES" $2
  ${IfNot} ${Errors}
  ${OrIf} $0 == 1
    !insertmacro SelectSection ${SECAO_INGLES}
  ${EndIf}
  ClearErrors
  ${GetOptions} $1 "/TVK" $2
  ${IfNot} ${Errors}
  ${OrIf} ${FileExists} "$INSTDIR\tvk.exe"
    !insertmacro SelectSection ${SECAO_TVK}
  ${EndIf}
FunctionEnd

; What we installed goes; a directory goes only when it is empty.
Section "Uninstall"
  !insertmacro ESPERAR_PROGRAMAS_LIVRES
  !insertmacro APAGAR_NOSSA_TRADUCAO
  !insertmacro APAGAR_TVK
  Delete "$INSTDIR\tolvaris.exe"
  Delete "$INSTDIR\tolvariscfg.exe"
  Delete "$INSTDIR\LEIAME.txt"
  Delete "$INSTDIR\CHANGELOG.txt"
  Delete "${DESINSTALADOR}"
  Delete "${ATALHO}"
  SetOutPath "$TEMP"
  RMDir "$INSTDIR\Roms"
  RMDir "$INSTDIR\Imgs"
  RMDir "$INSTDIR\Saves"
  RMDir "$INSTDIR"
  DeleteRegKey HKCU "${CHAVE}"
  ${If} ${Cmd} `MessageBox MB_YESNO|MB_ICONQUESTION|MB_DEFBUTTON2 "$(APAGAR_AJUSTES)" /SD IDNO IDYES`
    DeleteRegKey HKCU "${AJUSTES}"
    DeleteRegKey /ifempty HKCU "Software\Roms"
  ${EndIf}
SectionEnd
