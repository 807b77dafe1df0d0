#pragma once

#include <functional>
#include <map>
#include <memory>
#include <string>

#include <QWidget>

namespace marlowbeck {

using FormMaker = std::function<std::unique_ptr<QWidget>()>;

/// Every form of forms/ by the name of its screen. Written by the build from what lies there.
const std::map<std::string, FormMaker>& Forms();

}  // namespace marlowbeck
