#pragma once

#include <stdexcept>

namespace device {

/// A failure that a person can act on. what() is one line: it names the file or the service, says what is
/// wrong with it, and what to do about it. Thrown inside the platform only; every C edge turns it into a code.
class Error : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// The device's database was damaged and now lies beside its old place under a new name; what() names both.
/// Opening the device again gives a fresh database.
class DamagedError : public Error {
public:
    using Error::Error;
};

/// The device's database is damaged and stays where it is, because an application runs on it; what() names both.
class DamagedInUseError : public Error {
public:
    using Error::Error;
};

}  // namespace device
