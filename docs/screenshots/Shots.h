#pragma once

#include <QWidget>

#include <memory>
#include <string>
#include <utility>
#include <vector>

class CARGBPlane;

/// A picture to take: its name and what it shows.
using Shot = std::pair<std::string, std::unique_ptr<QWidget>>;

/// Every control. Paints `plane` and shows it; it must live as long as the shots.
std::vector<Shot> controlShots(CARGBPlane& plane);

/// Every pane: folded and extended, each tab, the modes that differ.
std::vector<Shot> paneShots();

/// The small windows.
std::vector<Shot> windowShots();
