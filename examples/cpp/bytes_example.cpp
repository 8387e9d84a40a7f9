// Digests a message in two parts, passes it through a cipher and back, and writes it in letters of
// five bits each.
//
// Prints:
//     in parts:  f96b697d7cb7938d525a2f31aaf161d0
//     at once:   f96b697d7cb7938d525a2f31aaf161d0
//     encrypted: 86fa04f2d653af52c3702d4d14c2
//     decrypted: message digest
//     spelled:   VPGQ
//     read:      abcd00

#include "3Util/Encrypt/Encrypt.h"

#include <cstdio>
#include <iostream>
#include <string>

namespace {

template <class TBytes>
std::string hex(TBytes const& bytes) {
    std::string text;
    for (auto const byte : bytes) {
        char digits[3];
        std::snprintf(digits, sizeof(digits), "%02x", static_cast<unsigned char>(byte));
        text += digits;
    }
    return text;
}

std::string const letters = "ABCDEFGHIJKLMNOPQRSTUVWXYZ234567";

std::string spell(Encrypt::TByteVector const& bytes) {
    std::string text;
    for (unsigned char const group : Encrypt::splitBytes(bytes, 5))
        text += letters[group];
    return text;
}

Encrypt::TByteVector read(std::string const& text) {
    Encrypt::TByteVector groups;
    for (char const letter : text)
        groups.push_back(static_cast<unsigned char>(letters.find(letter)));
    return Encrypt::mergeBytes(groups, 5);
}

} // namespace

int main() {
    std::string const message = "message digest";

    // The digest is there when the creator is gone.
    Encrypt::TMd5Digest digest;
    {
        Encrypt::CMd5Creator creator(digest);
        creator.process(message.substr(0, 7));
        creator.process(message.substr(7));
    }
    std::cout << "in parts:  " << hex(digest) << "\n";
    std::cout << "at once:   " << hex(Encrypt::md5(message)) << "\n";

    std::string const secret = Encrypt::rc4("Key", message);
    std::cout << "encrypted: " << hex(secret) << "\n";
    std::cout << "decrypted: " << Encrypt::rc4("Key", secret) << "\n";

    std::string const spelled = spell({0xAB, 0xCD});
    std::cout << "spelled:   " << spelled << "\n";
    // Twenty bits come back as three bytes, the last of them filled up with zeros.
    std::cout << "read:      " << hex(read(spelled)) << "\n";
}
