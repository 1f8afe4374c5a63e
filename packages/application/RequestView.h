#pragma once

#include <app-assist/WView.h>

#include <string>
#include <vector>

/// The application's icon, and below it the launch request that it was given last, a line for each extra.
class RequestView : public app_assist::WView {
public:
    /// `icon` is a picture's path, "" for none.
    explicit RequestView(std::string icon) : icon_(std::move(icon)) {}

    void show(const std::vector<std::string>& lines);

private:
    Evas_Object* onCreate(Evas_Object* parent, void* viewParam) override;
    void addIcon(Evas_Object* page) const;
    void addLines(Evas_Object* page);

    const std::string icon_;
    Evas_Object* lines_ = nullptr;
};
