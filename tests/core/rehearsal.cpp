#include "tests/core/rehearsal.h"

#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <sstream>
#include <utility>

#include "platform/base/run_loop.h"
#include "platform/stage/clock.h"
#include "platform/stage/commands.h"
#include "platform/stage/desktop.h"
#include "platform/stage/four_char_code.h"
#include "platform/stage/journal.h"
#include "platform/stage/transcript.h"

namespace {

std::string sJournal;
std::string sSent;

void listen(const stage::JournalLine& line) {
  sJournal += line.text + "\n";
  const bool script = line.kind == stage::Entry::Script;
  // The keystroke helper's keys go to somebody; the daemon's are pressed in some process.
  const bool key = line.kind == stage::Entry::Key && line.text.find(" in ") != std::string::npos;
  if (!script && !key && line.kind != stage::Entry::Event && line.kind != stage::Entry::SoundKey) return;
  sSent += (script ? line.source : line.text) + "; ";
}

std::string readAll(int descriptor) {
  std::string text;
  char bytes[4096];
  for (ssize_t count; (count = read(descriptor, bytes, sizeof bytes)) > 0;) {
    text.append(bytes, static_cast<std::size_t>(count));
  }
  return text;
}

void writeAll(int descriptor, const std::string& text) {
  for (std::size_t done = 0; done < text.size();) {
    const ssize_t count = write(descriptor, text.data() + done, text.size() - done);
    if (count <= 0) std::abort();
    done += static_cast<std::size_t>(count);
  }
}

}  // namespace

std::string inChild(const std::function<std::string()>& play) {
  int ends[2];
  if (pipe(ends) != 0) return "no pipe";
  const pid_t child = fork();
  if (child == 0) {
    close(ends[0]);
    stage::useVirtualTime();
    base::setTimeSource({stage::now, {}, stage::pass});
    stage::setUpDesktop();
    stage::setJournalListener(listen);
    writeAll(ends[1], play());
    close(ends[1]);
    std::exit(0);
  }
  close(ends[1]);
  const std::string text = readAll(ends[0]);
  close(ends[0]);
  int status = 0;
  waitpid(child, &status, 0);
  return status == 0 ? text : text + "\nthe child ended with status " + std::to_string(status);
}

std::string transcriptOf(const std::string& commands) {
  return inChild([&] {
    std::FILE* const input = std::tmpfile();
    writeAll(fileno(input), commands);
    std::rewind(input);
    std::ostringstream output;
    const int status = stage::playTranscript(fileno(input), output);
    std::fclose(input);
    return output.str() + (status == 0 ? "" : "status " + std::to_string(status) + "\n");
  });
}

void set(const std::string& commands) {
  for (std::size_t start = 0; start < commands.size();) {
    const std::size_t end = std::min(commands.find("; ", start), commands.size());
    const auto error = stage::runCommand(commands.substr(start, end - start));
    if (error) {
      std::fprintf(stderr, "%s: %s\n", commands.c_str(), error->c_str());
      std::abort();
    }
    start = end + 2;
  }
}

std::string journal() { return std::exchange(sJournal, {}); }

std::string sent() { return std::exchange(sSent, {}); }

std::string codeText(FourCharCode code) { return stage::fourCharacters(code); }
