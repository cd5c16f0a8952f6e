#include "platform/screen/help.h"

namespace live {

namespace {

constexpr HelpRow kHelp[] = {
    {L"",
     L"kvd turns the buttons of a media remote into actions on media applications. Each button goes to the "
     L"application in front, else to one that plays, else to the one chosen last."},
    {L"", L""},
    {L"1-9", L"open the application with this number; if it runs, bring it to the front"},
    {L"x then 1-9", L"close it"},
    {L"0", L"nobody is in front"},
    {L"↑ ↓ ← →", L"the remote's arrows; Enter selects, m and a are its menus"},
    {L"Space", L"Play/Pause; n next, p previous"},
    {L"+ -", L"volume"},
    {L"f r", L"hold fast forward or rewind down; the same key lets it go"},
    {L"l", L"lock the screen or unlock it; while it is locked kvd launches nothing"},
    {L":", L"type a command, for example :hold volume-up 3s; :help lists them all"},
    {L"Page Up", L"look back in the journal; Page Down comes back"},
    {L"q, Ctrl-C", L"quit"},
    {L"", L""},
    {L"", L"Any other key leaves this page."},
};

}  // namespace

std::span<const HelpRow> helpRows() { return kHelp; }

}  // namespace live
