#pragma once
// Thirty-two bytes looked at together:
//
//     const ZelSvcXmlBlock block{at};
//     const std::uint32_t ends = zel_svc_xml_mask(block.equal('<') | block.equal('&'));
//     if (ends != 0) at += std::countr_zero(ends);

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstring>

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

inline constexpr std::size_t ZEL_SVC_XML_BLOCK_SIZE = 32;

// All bits of byte N are set where byte N fits, none elsewhere. GCC and Clang turn the operations of these
// vectors into those of the processor, whichever it is.
using ZelSvcXmlLanes = unsigned char __attribute__((vector_size(16)));

struct ZelSvcXmlFits {
    ZelSvcXmlLanes low;
    ZelSvcXmlLanes high;

    friend ZelSvcXmlFits operator|(const ZelSvcXmlFits &one, const ZelSvcXmlFits &other) {
        return {one.low | other.low, one.high | other.high};
    }
};

class ZelSvcXmlBlock {
  public:
    explicit ZelSvcXmlBlock(const char *bytes) {
        std::memcpy(&low_, bytes, sizeof low_);
        std::memcpy(&high_, bytes + sizeof low_, sizeof high_);
    }

    void store(char *target) const {
        std::memcpy(target, &low_, sizeof low_);
        std::memcpy(target + sizeof low_, &high_, sizeof high_);
    }
    [[nodiscard]] ZelSvcXmlFits equal(char byte) const {
        const auto value = static_cast<unsigned char>(byte);
        return {static_cast<ZelSvcXmlLanes>(low_ == value), static_cast<ZelSvcXmlLanes>(high_ == value)};
    }
    [[nodiscard]] ZelSvcXmlFits at_most(char byte) const {
        const auto value = static_cast<unsigned char>(byte);
        return {static_cast<ZelSvcXmlLanes>(low_ <= value), static_cast<ZelSvcXmlLanes>(high_ <= value)};
    }

  private:
    ZelSvcXmlLanes low_;
    ZelSvcXmlLanes high_;
};

// Bit N tells of byte N, on any processor.
inline std::uint32_t zel_svc_xml_portable_mask(const ZelSvcXmlFits &fits) {
    std::uint32_t mask = 0;
    for (unsigned lane = 0; lane < 16; ++lane) {
        mask |= (fits.low[lane] & 1U) << lane;
        mask |= (fits.high[lane] & 1U) << (lane + 16);
    }
    return mask;
}

#if defined(__SSE2__)
inline std::uint32_t zel_svc_xml_mask(const ZelSvcXmlFits &fits) {
    const auto low = static_cast<std::uint32_t>(_mm_movemask_epi8(reinterpret_cast<const __m128i &>(fits.low)));
    const auto high = static_cast<std::uint32_t>(_mm_movemask_epi8(reinterpret_cast<const __m128i &>(fits.high)));
    return low | high << 16U;
}
#else
inline std::uint32_t zel_svc_xml_mask(const ZelSvcXmlFits &fits) { return zel_svc_xml_portable_mask(fits); }
#endif
