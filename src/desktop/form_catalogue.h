#pragma once

#include <functional>
#include <map>
#include <memory>
#include <string>

#include <QWidget>

namespace marlowbeck {

using FormMaker = std::function<std::unique_ptr<QWidget>()>;

/// Every form by the name of its screen: those of forms/, which the build lists, and what was
/// added.
const std::map<std::string, FormMaker>& Forms();
/// Adds the form of a screen that is none of the program's own, so that it can be shown too.
void AddForm(const std::string& screen, FormMaker maker);

}  // namespace marlowbeck
