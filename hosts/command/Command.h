#pragma once

namespace orvela {

/// Runs the program with its arguments and returns its exit status. Called once, before any thread is made.
int runCommand(int argc, char** argv);

} // namespace orvela
