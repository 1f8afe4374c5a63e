#include "FolderWatch.h"

#include <array>
#include <sys/inotify.h>
#include <system_error>
#include <unistd.h>
#include <utility>

// The folder around it is watched: of its own end a folder tells only when no file that was in it is open any more.
FolderWatch::FolderWatch(std::filesystem::path folder, std::function<void()> gone)
    : folder_(std::move(folder)), gone_(std::move(gone)), events_(inotify_init1(IN_NONBLOCK | IN_CLOEXEC)) {
    constexpr unsigned wanted = IN_DELETE | IN_MOVED_FROM | IN_ONLYDIR;
    if (events_ && inotify_add_watch(events_.get(), folder_.parent_path().c_str(), wanted) >= 0)
        handler_ = ecore_main_fd_handler_add(events_.get(), ECORE_FD_READ, onEvent, this, nullptr, nullptr);
}

FolderWatch::~FolderWatch() {
    if (handler_)
        ecore_main_fd_handler_del(handler_);
}

Eina_Bool FolderWatch::onEvent(void* watch, Ecore_Fd_Handler*) noexcept {
    auto* self = static_cast<FolderWatch*>(watch);
    alignas(inotify_event) std::array<char, 4096> events;
    while (read(self->events_.get(), events.data(), events.size()) > 0) {
    }
    std::error_code ignored;
    if (std::filesystem::exists(self->folder_, ignored))
        return ECORE_CALLBACK_RENEW;
    self->handler_ = nullptr;
    self->gone_();
    return ECORE_CALLBACK_CANCEL;
}
