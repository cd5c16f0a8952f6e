// A socket on which one client at a time says lines and is answered.
#pragma once

#include <functional>
#include <string>

/// Listens at a path; whoever listened there before is not found there any more.
void listenForLines(const std::string& path);

/// Polls as readable when there is something to serve; -1 before listenForLines.
int lineDescriptor();

/// Answers all lines that have come, without waiting.
void serveLines(const std::function<std::string(const std::string& line)>& answer);
