#include "1Base/BaseMacOS/BaseMacOSAccountService.h"

#include <systemd/sd-bus.h>

#include <atomic>
#include <cstdint>
#include <mutex>
#include <thread>

namespace TestSupport {
namespace {

constexpr char serviceName[] = "org.freedesktop.Accounts";
constexpr char servicePath[] = "/org/freedesktop/Accounts";
constexpr char userPath[] = "/org/freedesktop/Accounts/User7";
constexpr std::uint64_t turnInMicroseconds = 20000;

} // namespace

class CAccountService::CImplementation {
  public:
    explicit CImplementation(std::string const& bus) {
        isServing_ = sd_bus_new(&bus_) >= 0 && sd_bus_set_address(bus_, bus.c_str()) >= 0 &&
                     sd_bus_set_bus_client(bus_, 1) >= 0 && sd_bus_start(bus_) >= 0 &&
                     sd_bus_add_object(bus_, nullptr, servicePath, findUser, this) >= 0 &&
                     sd_bus_add_object(bus_, nullptr, userPath, getProperty, this) >= 0 &&
                     sd_bus_request_name(bus_, serviceName, 0) >= 0;
        if (isServing_)
            thread_ = std::thread([this] { serve(); });
    }

    ~CImplementation() {
        isServing_ = false;
        if (thread_.joinable())
            thread_.join();
        sd_bus_flush_close_unref(bus_);
    }

    CImplementation(CImplementation const&) = delete;
    CImplementation& operator=(CImplementation const&) = delete;

    std::atomic<bool> isServing_;
    std::atomic<EFault> fault_ = efaNone;
    mutable std::mutex mutex_; // of what follows
    std::string email_;
    std::vector<long> usersAsked_;

  private:
    void serve() {
        while (isServing_) {
            if (sd_bus_process(bus_, nullptr) == 0)
                sd_bus_wait(bus_, turnInMicroseconds);
        }
    }

    static int findUser(sd_bus_message* message, void* self, sd_bus_error*) {
        auto& service = *static_cast<CImplementation*>(self);
        std::int64_t user = 0;
        if (sd_bus_message_is_method_call(message, serviceName, "FindUserById") <= 0 ||
            sd_bus_message_read(message, "x", &user) < 0)
            return 0;
        {
            std::lock_guard<std::mutex> const lock(service.mutex_);
            service.usersAsked_.push_back(static_cast<long>(user));
        }
        switch (service.fault_) {
        case efaSilent:
            return 1;
        case efaUnknownUser:
            return sd_bus_reply_method_errorf(message, "org.freedesktop.Accounts.Error.Failed",
                                              "no such user");
        case efaOtherReply:
            return sd_bus_reply_method_return(message, "u", 7U);
        default:
            return sd_bus_reply_method_return(message, "o", userPath);
        }
    }

    static int getProperty(sd_bus_message* message, void* self, sd_bus_error*) {
        auto& service = *static_cast<CImplementation*>(self);
        char const* interface = nullptr;
        char const* name = nullptr;
        if (sd_bus_message_is_method_call(message, "org.freedesktop.DBus.Properties", "Get") <= 0 ||
            sd_bus_message_read(message, "ss", &interface, &name) < 0 ||
            interface != std::string("org.freedesktop.Accounts.User") ||
            name != std::string("Email"))
            return 0;
        std::lock_guard<std::mutex> const lock(service.mutex_);
        switch (service.fault_) {
        case efaSilentProperty:
            return 1;
        case efaNoProperty:
            return sd_bus_reply_method_errorf(message, SD_BUS_ERROR_UNKNOWN_PROPERTY, "none");
        case efaOtherProperty:
            return sd_bus_reply_method_return(message, "v", "u", 7U);
        default:
            return sd_bus_reply_method_return(message, "v", "s", service.email_.c_str());
        }
    }

    sd_bus* bus_ = nullptr;
    std::thread thread_;
};

CAccountService::CAccountService(std::string const& bus)
    : implementation_(std::make_unique<CImplementation>(bus)) {}

CAccountService::~CAccountService() = default;

bool CAccountService::isServing() const {
    return implementation_->isServing_;
}

void CAccountService::setEmail(std::string const& email) {
    std::lock_guard<std::mutex> const lock(implementation_->mutex_);
    implementation_->email_ = email;
}

void CAccountService::setFault(EFault fault) {
    implementation_->fault_ = fault;
}

std::vector<long> CAccountService::usersAsked() const {
    std::lock_guard<std::mutex> const lock(implementation_->mutex_);
    return implementation_->usersAsked_;
}

} // namespace TestSupport
