// Every fixed number and text of the checker, in one place.
// Portable: no Windows headers here, so the core and its tests share the same values.
#pragma once

#include <cstdint>
#include <string_view>

namespace checker {

// ---------------------------------------------------------------- shared
namespace common {
// Private-profile reads use a 50-character buffer unless a caller says otherwise,
// so a value is at most 49 characters long.
inline constexpr std::size_t kIniBufferChars = 50;
inline constexpr int kTwipsPerInch = 1440;
inline constexpr int kDefaultTwipsPerPixel = 15; // at 96 dpi
// prSetTopMost: SetWindowPos(hwnd, HWND_TOPMOST, 0, 0, 0, 0, SWP_NOSIZE|SWP_NOMOVE|SWP_FRAMECHANGED|SWP_SHOWWINDOW)
inline constexpr std::intptr_t kHwndTopMost = -1;
inline constexpr unsigned kTopMostFlags = 0x63;
} // namespace common

// ---------------------------------------------------------------- start-up and host discovery
namespace startup {
inline constexpr std::string_view kApplicationIni = "\\Application.INI";
inline constexpr std::string_view kClientIni = "\\CLIENT.INI";
inline constexpr std::string_view kSectionGeneral = "General";
inline constexpr std::string_view kKeyApplication = "Application";
inline constexpr std::string_view kKeyServerPath = "ServerPath";

inline constexpr std::string_view kNameMainPro = "ORVEL ZARN PRO";
inline constexpr std::string_view kNameMainGold = "ORVEL ZARN GOLD";
inline constexpr std::string_view kNameSecond = "ORVEL DO ZARN";
inline constexpr std::string_view kCaptionMain = "Orvel Zarn Pro";
inline constexpr std::string_view kCaptionSecond = "Orvel DO Zarn";
inline constexpr std::string_view kTitleNameMain = "CheckOZProUpdate";
inline constexpr std::string_view kTitleNameSecond = "CheckODOZUpdate";

// Installation types.
inline constexpr std::int32_t kInstallStandAlone = 1;
inline constexpr std::int32_t kInstallNetworkClient = 3;
inline constexpr std::int32_t kInstallSecondProduct = 4;

// Marker files, relative to the checker folder.
inline constexpr std::string_view kMarkerMainExe = "\\OZPLICNew.exe";
inline constexpr std::string_view kMarkerMainBlank = "\\DATA\\OZPBLANK.ACCDB";
inline constexpr std::string_view kMarkerSecondExe = "\\OrvelDo.exe";
inline constexpr std::string_view kMarkerSecondBlank = "\\DATA\\ODOZBLANK.MDB";

// Database files and the rows of PlanIDs.
inline constexpr std::string_view kDatabaseMain = "\\data\\Ozp.ACCDB";
inline constexpr std::string_view kDatabaseClientTail = "data\\Ozp.ACCDB"; // joined to ServerPath as is
inline constexpr std::string_view kDatabaseSecond = "\\data\\Odoz.Mdb";
inline constexpr std::uint8_t kCustPlanMain = 14;
inline constexpr std::uint8_t kCustPlanSecond = 89;
inline constexpr int kPlanCustomerIdFlag = 999;

// Host executables whose file version is the installed version.
inline constexpr std::string_view kHostExeMain = "\\OZPLICNew.EXE";
inline constexpr std::string_view kHostExeSecond = "\\OrvelDo.EXE";

// Host automation components and the database connection.
inline constexpr std::string_view kProgIdPlan = "QvlZarnPlan.clsZarnPlan";
inline constexpr std::string_view kProgIdProtect = "QVLEncryption.clsProtect";
inline constexpr std::string_view kPlanCode = "QK$27NOV";
inline constexpr char kPasswordFieldSeparator = '~';
inline constexpr std::string_view kConnPrefix = "Provider=Microsoft.ACE.OLEDB.12.0;Data Source=";
inline constexpr std::string_view kConnMiddle = ";Persist Security Info=False;Jet OLEDB:Database Password=";
inline constexpr std::string_view kSqlSettings = "Select * from PlanIDs "; // the trailing blank belongs to it
inline constexpr std::string_view kSqlCustomerRow = "Select settings,plan from planids";
inline constexpr std::string_view kFilterPrefix = "Plan = ";
inline constexpr std::string_view kFindPrefix = "plan = ";

// The key the host's protection component expects before it deciphers anything: 7 characters,
// four of them outside printable ASCII (BEL, section sign, unit separator), as the host fixes it.
inline constexpr std::string_view kSecretKey = "Q" "\x07" "v" "\xA7" "L" "\x1F" "z";
inline constexpr std::string_view kProgIdConnection = "ADODB.Connection";
inline constexpr std::string_view kProgIdRecordset = "ADODB.Recordset";
inline constexpr std::string_view kColumnSettings = "Settings";
// Member names called by late binding.
inline constexpr std::string_view kMemberSecretKey = "SecretKey";
inline constexpr std::string_view kMemberGetPlanName = "getPlanName";
inline constexpr std::string_view kMemberDecryptURL = "DecryptURL";
inline constexpr std::string_view kMemberState = "State";
inline constexpr std::string_view kMemberOpen = "Open";
inline constexpr std::string_view kMemberClose = "Close";
inline constexpr std::string_view kMemberFilter = "Filter";
inline constexpr std::string_view kMemberEOF = "EOF";
inline constexpr std::string_view kMemberFields = "Fields";
inline constexpr std::string_view kMemberItem = "Item";
inline constexpr std::string_view kMemberValue = "Value";
inline constexpr std::string_view kMemberFind = "Find";
// ADO enumeration values the reads use.
inline constexpr std::int32_t kAdStateClosed = 0;
inline constexpr std::int32_t kAdStateOpen = 1;
inline constexpr std::int32_t kAdOpenStatic = 3;
inline constexpr std::int32_t kAdLockReadOnly = 1;
inline constexpr std::int32_t kAdFilterNone = 0;
inline constexpr std::int32_t kAdSearchForward = 1;
inline constexpr std::int32_t kAdBookmarkFirst = 1;
inline constexpr std::int32_t kFirstColumn = 0;
// Customer id: the code of the first character, then at most this many last characters.
inline constexpr std::size_t kCustIdTailChars = 5;
inline constexpr char kVersionSeparator = '.';
// Runtime error 5, raised for the code of the first character of an empty text.
inline constexpr std::int32_t kErrInvalidCall = 5;
inline constexpr std::string_view kErrInvalidCallText = "Invalid procedure call or argument";

// Process walk (ANSI entries): the name field holds 260 characters.
inline constexpr std::size_t kProcessNameChars = 260;
inline constexpr unsigned kTerminateExitCode = 0;
} // namespace startup

// ---------------------------------------------------------------- update service client
namespace service {
// Base address of the update service; the build may override it, the environment wins.
inline constexpr std::string_view kServerEnvVar = "CHECKER_UPDATE_SERVER";

inline constexpr std::string_view kPathCheck = "/SUPPORT/Downloads/CheckWebUpdate.asp?";
inline constexpr std::string_view kPathCheckNewLicence = "/SUPPORT/Downloads/CheckOZProUpdate.asp?";
inline constexpr std::string_view kPathDownload = "/Support/downloads/UpdateString.asp?";
inline constexpr std::string_view kPathDownloadNewLicence = "/Support/downloads/OZProUpdateString.asp?";
inline constexpr std::string_view kPathDate = "/SUPPORT/Downloads/QVLDATETime.asp";

inline constexpr char kFieldSeparator = ',';
inline constexpr std::size_t kFieldLatestVersion = 1;
inline constexpr std::size_t kFieldUpdateFlag = 3;

// Errors of the language runtime the service client reports.
inline constexpr std::int32_t kErrSubscript = 9;
inline constexpr std::int32_t kErrTypeMismatch = 13;
// The HTTP layer's "server cannot be found" (0x800C0005).
inline constexpr std::int32_t kErrServerNotFound = -2146697211;
inline constexpr std::string_view kDateUnavailable = "Service provider is unavailable. Please try later";
inline constexpr std::string_view kDateFailed = "99999";

// Request strings: keys in the order each builder writes them.
inline constexpr std::string_view kKeySelect = "Select=";
inline constexpr std::string_view kKeyCDKey = "&txtCDKey=";
inline constexpr std::string_view kKeyMajorVersion = "&MajorVersion=";
inline constexpr std::string_view kKeyCustCode = "&CustCode=";
inline constexpr std::string_view kKeyProdSubId = "&ProdSubId=";
inline constexpr std::string_view kKeyMinorVersion = "&MinorVersion=";
inline constexpr std::string_view kKeyCustID = "&CustID=";
inline constexpr std::string_view kKeySetupType = "&Setuptype=";
inline constexpr std::string_view kKeyReportHead = "&ReportHead=";
inline constexpr std::string_view kPairUserType = "&UserType=Desktop";
inline constexpr std::string_view kKeyMinorVersionDownload = "&Minorversion=";
inline constexpr std::string_view kBlank = " ";
inline constexpr std::string_view kBlankOnWire = "+";
inline constexpr std::string_view kHeadAmpersand = "&";
inline constexpr std::string_view kHeadAmpersandOnWire = "~~";
inline constexpr char kVersionPartSeparator = '.';

// Error sources: each operation's own name (two with their trailing blank).
inline constexpr std::string_view kSrcInputStringCheck = "fnInputStringCheck";
inline constexpr std::string_view kSrcInputStringCheckNewLicence = "fnInputStringCheckNewLicence";
inline constexpr std::string_view kSrcInputStringDownLoad = "fnInputStringDownLoad ";
inline constexpr std::string_view kSrcInputStringDownLoadNewLicence = "fnInputStringDownLoadNewLicence ";
inline constexpr std::string_view kSrcGetInfoCheckUpdate = "fnGetInfoCheckUpdate";
inline constexpr std::string_view kSrcGetInfoCheckUpdateNewLicence = "fnGetInfoCheckUpdateNewLicence";
inline constexpr std::string_view kSrcGetInfoDownload = "fnGetInfoDownload";
inline constexpr std::string_view kSrcGetInfoDownloadNewLicence = "fnGetInfoDownloadNewLicence";
inline constexpr std::string_view kSrcValidateCheckInfo = "prValidateCheckInfo";
inline constexpr std::string_view kSrcGetExeVersion = "prGetExeVersion";
inline constexpr std::int32_t kErrOutOfMemory = 7;
inline constexpr std::string_view kTextOutOfMemory = "Out of memory";
inline constexpr std::int32_t kErrObjectNotSet = 91;
inline constexpr std::string_view kTextObjectNotSet = "Object variable or With block variable not set";

// HTTP methods and the request object.
inline constexpr std::string_view kMethodGet = "GET";
inline constexpr std::string_view kMethodPost = "POST";
inline constexpr std::string_view kProgIdXmlHttp = "MSXML2.XMLHTTP";
// The MSXML 3.0 XMLHTTP class, {F5078F35-C551-11D3-89B9-0000F81FE221}.
inline constexpr std::string_view kClsidXmlHttp30 = "{F5078F35-C551-11D3-89B9-0000F81FE221}";
inline constexpr std::int32_t kErrCannotCreateObject = 429;
inline constexpr std::string_view kTextCannotCreateObject = "ActiveX component can't create object";

// The date written back: month, day, year with the regional separator between.
inline constexpr int kDateMonthDigits = 2;
inline constexpr int kDateDayDigits = 2;
inline constexpr int kDateYearDigits = 4;

// Answer fields: the truth words, in any letter case.
inline constexpr std::string_view kTextTrue = "True";
inline constexpr std::string_view kTextFalse = "False";
// Members of the request object called by name.
inline constexpr std::string_view kMemberOpen = "open";
inline constexpr std::string_view kMemberSend = "send";
inline constexpr std::string_view kMemberResponseText = "responseText";
inline constexpr std::string_view kMemberStatus = "status";
// No answer at all to a request (INET_E_DATA_NOT_AVAILABLE, 0x800C0007).
inline constexpr std::int32_t kErrNoAnswer = -2146697209;
inline constexpr std::string_view kTextNoAnswer = "No data is available for the requested resource";
} // namespace service

// ---------------------------------------------------------------- check cycle and tray front end
namespace tray {
#ifdef CHECKER_BENCH_TIMER1_MS
// Only the bench build shortens the tick, to count many ticks in little time.
inline constexpr unsigned kTimer1IntervalMs = CHECKER_BENCH_TIMER1_MS;
#else
inline constexpr unsigned kTimer1IntervalMs = 6500;
#endif
inline constexpr unsigned kTimer2IntervalMs = 1000;
inline constexpr std::int16_t kTicksPerCheck = 15;

// Server folder hand-off file.
inline constexpr std::string_view kUpdateInfoIniExists = "\\UpdateInfo.ini";
inline constexpr std::string_view kUpdateInfoIni = "\\UpdateInfo.INI";
inline constexpr std::string_view kSectionVersionInfo = "VERSIONINFO";
inline constexpr std::string_view kKeyBaseVersMajor = "BaseVersMajor";
inline constexpr std::string_view kKeyBaseVersMinor = "BaseVersMinor";
inline constexpr std::string_view kKeyVersMajorAvai = "VersMajorAvai";
inline constexpr std::string_view kKeyVersMinorAvai = "VersMinorAvai";
inline constexpr std::string_view kKeyPatcFileName = "PatcFileName";
inline constexpr std::size_t kVersionValueChars = 9;   // longest version value read
inline constexpr std::size_t kPatchNameChars = 49;     // longest patch file name read
inline constexpr std::size_t kServerPathChars = 49;    // longest ServerPath read by the tick
inline constexpr int kMessageRunsBeforePatch = 3;

// Daily schedule.
inline constexpr std::string_view kUpdateIni = "\\Update.INI";
inline constexpr std::string_view kKeyCurrDate = "CurrDate";
inline constexpr std::size_t kCurrDateBufferChars = 12; // 11 characters and the NUL
inline constexpr std::string_view kFallbackDate = "20/10/1999";
inline constexpr std::string_view kLatestVersionLabel = "Latest version available : ";

// Slide-in, in twips.
inline constexpr int kSlideStartTop = 15000;
inline constexpr int kSlideRightMargin = 50;
inline constexpr int kSlideStep = 1;
inline constexpr int kSlideInitialMessageRuns = 2;
inline constexpr int kScreenLargeWidthPx = 1152;
inline constexpr int kScreenLargeHeightPx = 864;
inline constexpr int kScreenMediumWidthPx = 1024;
inline constexpr int kScreenMediumHeightPx = 768;
inline constexpr int kStopLineLarge = 10150;
inline constexpr int kStopLineMedium = 8650;
inline constexpr int kStopLineOther = 6150;
inline constexpr int kMessageRunsLarge = 1000;
inline constexpr int kMessageRunsOther = 300;

// The window, in twips.
inline constexpr int kClientWidth = 3435;
inline constexpr int kClientHeight = 2130;
inline constexpr int kArtworkWidthPx = 229;
inline constexpr int kArtworkHeightPx = 146;
inline constexpr int kPicture1Left = 0, kPicture1Top = -120, kPicture1Width = 3735, kPicture1Height = 2295;
inline constexpr int kGetUpdateLeft = 120, kGetUpdateTop = 1785, kGetUpdateWidth = 1500, kGetUpdateHeight = 255;
inline constexpr int kCancelLeft = 1800, kCancelTop = 1785, kCancelWidth = 1500, kCancelHeight = 255;
inline constexpr int kLabel2Left = 0, kLabel2Top = 120, kLabel2Width = 3495, kLabel2Height = 255;
inline constexpr int kCommandFontTenthsPt = 98; // Arial 9.75 pt bold
inline constexpr int kLabel2FontTenthsPt = 90;  // Arial 9 pt bold
inline constexpr std::string_view kGetUpdateText = "&Get Update";
inline constexpr std::string_view kCancelText = "&Cancel";
inline constexpr std::string_view kLabel2DesignText = "Latest Version Available: 3.3.4";

// Tray icon.
inline constexpr unsigned kTrayCallbackMessage = 1400; // WM_TRAYNOTIFY
inline constexpr unsigned kTrayIconId = 0;
inline constexpr unsigned kTrayAddFlags = 7;    // NIF_MESSAGE | NIF_ICON | NIF_TIP
inline constexpr unsigned kTrayDeleteFlags = 2; // NIF_ICON
inline constexpr std::size_t kTrayTipBytes = 64;
inline constexpr std::string_view kTipMain = "OZPro Live Update";
inline constexpr std::string_view kTipSecond = "ODOZ Live Update";
inline constexpr std::string_view kMenuCheckUpdate = "&Check Update";
inline constexpr std::string_view kMenuClose = "&Close";

// Programs the checker starts.
inline constexpr std::string_view kUpdaterExe = "\\KtrLiveUpdate.exe";
inline constexpr int kShowNormal = 1;    // SW_SHOWNORMAL: patch program
inline constexpr int kShowMaximized = 3; // SW_SHOWMAXIMIZED: updater

// A patch name is a bare file name: these parts would reach outside the checker folder.
inline constexpr std::string_view kPathSeparators = "\\/";
inline constexpr char kDriveMark = ':';
inline constexpr std::string_view kParentFolder = "..";

// The shell broadcasts this when it (re)starts; the icon is then added again.
inline constexpr std::string_view kTaskbarCreatedMessage = "TaskbarCreated";
inline constexpr unsigned kMenuIdCheckUpdate = 101;
inline constexpr unsigned kMenuIdClose = 102;
inline constexpr int kIconResourceId = 1;
inline constexpr int kLabelIdGetUpdate = 201;
inline constexpr int kLabelIdCancel = 202;
inline constexpr int kLabelId2 = 203;
inline constexpr std::string_view kLabelFont = "Arial";

// Artwork (pixels of the 229 x 146 picture) and its colours as 0xRRGGBB.
inline constexpr std::string_view kArtworkTitle = "Live Update";
inline constexpr int kArtworkTitleTop = 34, kArtworkTitleHeight = 44;
inline constexpr int kArtworkTitlePointsTenths = 200; // Arial 20 pt bold
inline constexpr int kArtworkBarInset = 3;            // around each label, in pixels
inline constexpr std::uint32_t kArtworkTitleColour = 0x1F4E99;
inline constexpr std::uint32_t kArtworkRuleColour = 0x8FB3E0;
inline constexpr std::uint32_t kArtworkBarColour = 0x2A5DB0;
inline constexpr std::uint32_t kArtworkBarEdgeColour = 0x16376E;
inline constexpr std::uint32_t kCommandTextColour = 0xFFFFFF;
inline constexpr std::uint32_t kLabel2TextColour = 0x000000;
} // namespace tray

// ---------------------------------------------------------------- message box
namespace msgbox {
inline constexpr std::int32_t kResultOk = 1;
inline constexpr std::int32_t kResultCancel = 2;
inline constexpr std::int32_t kResultYes = 6;
inline constexpr std::int32_t kResultNo = 7;

inline constexpr std::int32_t kStyleOk = 0;
inline constexpr std::int32_t kStyleOkCancel = 1;
inline constexpr std::int32_t kStyleYesNoCancel = 3;
inline constexpr std::int32_t kStyleYesNo = 4;

inline constexpr std::string_view kCaptionOk = "&OK";
inline constexpr std::string_view kCaptionYes = "&Yes";
inline constexpr std::string_view kCaptionNo = "&No";
inline constexpr std::string_view kCaptionCancel = "&Cancel";
inline constexpr std::string_view kCaptionClose = "X";
inline constexpr std::string_view kWindowCaption = "Message";
inline constexpr std::string_view kDesignTitle = "Message";
inline constexpr std::string_view kDesignMessage = "Error message";

// Design, in twips.
inline constexpr int kWindowWidth = 6855, kWindowHeight = 1350;
inline constexpr int kFrameLeft = 0, kFrameTop = 0, kFrameWidth = 6840, kFrameHeight = 315;
inline constexpr int kCaptionLeft = 90, kCaptionTop = 60, kCaptionWidth = 765, kCaptionHeight = 195;
inline constexpr int kCloseLeft = 6510, kCloseTop = 30, kCloseWidth = 300, kCloseHeight = 255;
inline constexpr int kImageLeft = 135, kImageTop = 465, kImageSize = 480;
inline constexpr int kMsgLeft = 660, kMsgTop = 435, kMsgWidth = 5955, kMsgHeight = 195;
inline constexpr int kSlot1Left = 3450, kSlot2Left = 4575, kSlot3Left = 5700;
inline constexpr int kButtonTop = 810, kButtonWidth = 1065, kButtonHeight = 435;
inline constexpr int kGrowthBase = 225; // d = fitted message height - 225
inline constexpr int kCentredLeft = 4500;
inline constexpr int kCentredSpan = 9600; // top = (9600 - height) / 2
inline constexpr int kUncentredLeft = 5000, kUncentredTop = 5000;
inline constexpr int kMessageFontTenthsPt = 83; // Verdana 8.25 pt bold
inline constexpr int kCaptionFontTenthsPt = 83; // MS Sans Serif 8.25 pt bold

// Colours as 0xRRGGBB.
inline constexpr std::uint32_t kBackground = 0xFAEFC9;  // RGB(250, 239, 201)
inline constexpr std::uint32_t kTitleText = 0xF7F7EF;   // RGB(247, 247, 239)
inline constexpr std::uint32_t kButtonBack = 0x000000;
inline constexpr std::uint32_t kButtonFore = 0xEFEEE6;  // RGB(239, 238, 230)
inline constexpr std::uint32_t kButtonForeDown = 0xFFFFFF;
inline constexpr std::uint32_t kCloseBackDown = 0xB0A6BA;  // RGB(176, 166, 186)
inline constexpr std::uint32_t kAnswerBackDown = 0x808080; // RGB(128, 128, 128)
inline constexpr std::uint32_t kShapeLine = 0xFFFFFF;

// Key codes the box answers (letters are their upper-case character).
inline constexpr int kKeyYes = 'Y';
inline constexpr int kKeyOk = 'O';
inline constexpr int kKeyNo = 'N';
inline constexpr int kKeyCancel = 'C';

// The flat button's picture placement; a caller's caption sets it to kPictureNone.
inline constexpr std::int32_t kPictureNone = 0;
inline constexpr std::int32_t kPictureLeft = 1;
inline constexpr int kButtonPicturePx = 16;  // check mark and cross
inline constexpr int kCancelPicturePx = 12;  // prohibition sign
inline constexpr std::uint32_t kPictureYellow = 0xFFFF00;
inline constexpr std::uint32_t kImageRed = 0xFF0000;
inline constexpr std::uint32_t kImageShadow = 0x808080;
inline constexpr std::uint32_t kImageEdge = 0x800000;
inline constexpr std::uint32_t kPictureOutline = 0x000000;
// The flat button's face, in pixels at 96 dpi, and the edge of its raised style.
inline constexpr int kButtonFocusInset = 2;
inline constexpr int kButtonTextInset = 2;
inline constexpr int kButtonPictureGap = 3;
inline constexpr std::uint32_t kButtonEdgeLight = 0x808080;
inline constexpr std::uint32_t kButtonEdgeDark = 0x404040;
inline constexpr std::string_view kMessageFont = "Verdana";
inline constexpr std::string_view kCaptionFont = "MS Sans Serif";
inline constexpr std::string_view kButtonFont = "MS Sans Serif";
inline constexpr int kButtonFontTenthsPt = 83;
// Where a font is missing: same size and weight in a face every Windows has.
inline constexpr std::string_view kSubstituteFont = "Tahoma";

// Dragging by the title strip: WM_SYSCOMMAND with SC_MOVE | HTCAPTION.
inline constexpr unsigned kSysCommandMessage = 0x112;
inline constexpr unsigned kSysCommandDragMove = 0xF012;
} // namespace msgbox

} // namespace checker
