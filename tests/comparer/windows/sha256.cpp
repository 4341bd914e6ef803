// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "comparer/sha256.h"

#include <array>
#include <stdexcept>

#include <windows.h>

#include <bcrypt.h>

namespace pelloric::cases {

namespace {

constexpr std::size_t HashBytes = 32;

void need(NTSTATUS status)
{
    if (status < 0)
        throw std::runtime_error("the system computes no SHA-256");
}

std::string hexadecimal(const std::array<UCHAR, HashBytes>& bytes)
{
    constexpr std::string_view Digits = "0123456789abcdef";
    std::string text;
    for (const UCHAR byte : bytes) {
        text += Digits[byte >> 4U];
        text += Digits[byte & 0xFU];
    }
    return text;
}

} // namespace

std::string sha256(std::string_view bytes)
{
    std::string input(bytes); // The system's function takes no constant bytes.
    std::array<UCHAR, HashBytes> hash {};
    BCRYPT_ALG_HANDLE algorithm = nullptr;
    need(BCryptOpenAlgorithmProvider(&algorithm, BCRYPT_SHA256_ALGORITHM, nullptr, 0));
    const NTSTATUS status
        = BCryptHash(algorithm, nullptr, 0, reinterpret_cast<UCHAR*>(input.data()),
            static_cast<ULONG>(input.size()), hash.data(), static_cast<ULONG>(hash.size()));
    BCryptCloseAlgorithmProvider(algorithm, 0);
    need(status);
    return hexadecimal(hash);
}

} // namespace pelloric::cases
