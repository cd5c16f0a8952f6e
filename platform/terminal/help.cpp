#include "platform/terminal/help.h"

namespace terminal {

namespace {

constexpr HelpRow kHelp[] = {
    {L"",
     L"kvd turns the buttons of a media remote into actions on media applications. Each button goes to the "
     L"application in front, else to one that plays, else to the one chosen last, else to the first player "
     L"that runs."},
    {L"", L""},
    {L"1-9", L"open the application of this number, or bring it to the front"},
    {L"x 1-9", L"close it"},
    {L"e 1-9", L"make it fail: answer errors, then nothing, then normally again"},
    {L"0", L"bring nobody to the front"},
    {L"↑ ↓ ← →", L"the remote's arrows; Enter selects, m and Esc are its menus"},
    {L"Space", L"Play/Pause; n next, p previous, . stop"},
    {L"+ - f r", L"hold the button down; the same key lets it go"},
    {L"l", L"lock the screen or unlock it: while locked, kvd launches nothing"},
    {L"c", L"capture the display, as slideshows do, or give it back"},
    {L"v", L"photo library of version 6, 7 or 8: kvd works each differently"},
    {L"s", L"scripts in full in the journal, or in short"},
    {L"Page Up", L"look back in the journal; Page Down comes back"},
    {L":", L"type a command such as :hang spindle 5s; :help lists them all"},
    {L":save FILE", L"write what you did so far as a transcript, a test of itself"},
    {L"q, Ctrl-C", L"quit; Ctrl-Z suspends"},
};

}  // namespace

std::span<const HelpRow> helpRows() { return kHelp; }

}  // namespace terminal
