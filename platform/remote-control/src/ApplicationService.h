#pragma once

#include "device/BootClock.h"
#include "remote-control/Server.h"

#include <Ecore.h>
#include <Eldbus.h>

#include <deque>
#include <functional>
#include <string>

namespace remote_control {

/// The interface com.ravella.device.Application on the bus: which device the
/// application belongs to, its end, launch requests to it, and when the last
/// one came. What a caller asks for is done from the main loop, after the
/// caller was answered.
class ApplicationService {
public:
  /// Throws device::Error when the bus does not take the object.
  ApplicationService(device::Bus &bus, const std::string &appId,
                     std::function<void()> quit, Server::LaunchHandler launch);
  ~ApplicationService();
  ApplicationService(const ApplicationService &) = delete;
  ApplicationService &operator=(const ApplicationService &) = delete;

private:
  static ApplicationService &of(const Eldbus_Service_Interface *interface);
  static Eldbus_Message *onQuit(const Eldbus_Service_Interface *interface,
                                const Eldbus_Message *request);
  static Eldbus_Message *onLaunch(const Eldbus_Service_Interface *interface,
                                  const Eldbus_Message *request);
  static Eina_Bool folder(const Eldbus_Service_Interface *interface,
                          const char *property, Eldbus_Message_Iter *value,
                          const Eldbus_Message *request,
                          Eldbus_Message **error);
  static Eina_Bool lastRequest(const Eldbus_Service_Interface *interface,
                               const char *property, Eldbus_Message_Iter *value,
                               const Eldbus_Message *request,
                               Eldbus_Message **error);
  static void doNext(void *service);
  void doLater(std::function<void()> work);

  device::Bus &bus_;
  const std::string appId_;
  const std::function<void()> quit_;
  const Server::LaunchHandler launch_;
  /// The first one comes with the application's start.
  double lastRequest_ = device::secondsSinceBoot();
  std::deque<std::function<void()>> waiting_;
  Ecore_Job *job_ = nullptr;
  Eldbus_Service_Interface *interface_ = nullptr;
};

} // namespace remote_control
