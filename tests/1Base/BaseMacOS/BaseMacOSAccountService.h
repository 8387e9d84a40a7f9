/// An account service for tests, on a bus of their own.
#ifndef QORN_TESTS_BASEMACOSACCOUNTSERVICE_H
#define QORN_TESTS_BASEMACOSACCOUNTSERVICE_H

#include <memory>
#include <string>
#include <vector>

namespace TestSupport {

/// Serves in a thread while it lives.
class CAccountService {
  public:
    enum EFault {
        efaNone,
        efaUnknownUser,    // an error for the user
        efaOtherReply,     // a number for the user
        efaNoProperty,     // an error for the address
        efaOtherProperty,  // a number for the address
        efaSilent,         // never a reply
        efaSilentProperty, // never one for the address
    };

    explicit CAccountService(std::string const& bus);
    ~CAccountService();

    CAccountService(CAccountService const&) = delete;
    CAccountService& operator=(CAccountService const&) = delete;

    /// Whether it got its place on the bus.
    bool isServing() const;

    void setEmail(std::string const& email);
    void setFault(EFault fault);

    /// The users that were asked for, in their order.
    std::vector<long> usersAsked() const;

  private:
    class CImplementation;
    std::unique_ptr<CImplementation> implementation_;
};

} // namespace TestSupport

#endif
