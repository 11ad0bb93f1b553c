#pragma once

#include "screens/toolkit/Control.h"
#include "screens/toolkit/Interface.h"
#include "screens/toolkit/TableView.h"
#include "screens/toolkit/TextField.h"

#include <memory>

namespace orvane
{

// The save screen's interface as a front end loads it from the file, without the parts named in
// `missing`.
inline std::unique_ptr<Interface> makeSaveScreen(const std::string& missing = "")
{
    const auto background = std::make_shared<Control>();
    auto interface = std::make_unique<Interface>(background);
    const auto add = [&](const char* name, const std::shared_ptr<View>& view) {
        if (missing.find(name) != std::string::npos)
            return;
        if (view != background)
            background->addSubview(view);
        interface->setOutlet(name, view);
    };
    const auto table = std::make_shared<TableView>();
    table->setFrame({0, 100, 320, 200});
    table->setVisibleRows(0, 100);
    add("saveContentTable", table);
    add("saveDescription", std::make_shared<TextField>());
    add("saveButton", std::make_shared<Button>("Save"));
    add("cancelButton", std::make_shared<Button>("Cancel"));
    add("background", background);
    return interface;
}

} // namespace orvane
