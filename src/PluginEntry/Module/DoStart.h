#pragma once

/// Does the work of the start selector over the current record: reads the host's picture, lets the user work
/// on it, and writes the result back, or tells the host that the user cancelled.
/// @throws CGenericEx with the text of the step that failed, its cause nested
void DoStart();
