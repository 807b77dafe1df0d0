#pragma once

namespace marlowbeck {

/// Adds the forms of the workbench and its shelf to those that windows are made from.
void AddWorkbenchForms();

}  // namespace marlowbeck
