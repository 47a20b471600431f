#pragma once

class QWidget;

namespace orvela {

/// Gives every tool button below `window` a palette in which its edges cannot be told from the window.
void flattenButtons(QWidget& window);

} // namespace orvela
