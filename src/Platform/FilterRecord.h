#pragma once

#include <cstddef>
#include <cstdint>

namespace orvela {

/// Our own model of the filter record that a host of the publicly documented filter interface hands the
/// module, with the types around it. Packed to 4, as on 32-bit and 64-bit hosts alike: never bind a reference
/// to a pointer member.
namespace host {

using Boolean = std::uint8_t;
using Fixed = std::int32_t; ///< signed 16.16

#pragma pack(push, 4)

struct Point {
    std::int16_t v;
    std::int16_t h;
};

/// Right and bottom are exclusive. All fields 0: nothing requested.
struct Rect {
    std::int16_t top;
    std::int16_t left;
    std::int16_t bottom;
    std::int16_t right;
};

struct RGBColor {
    std::uint16_t red;
    std::uint16_t green;
    std::uint16_t blue;
};

struct FilterColor {
    std::uint8_t components[4];
};

struct PlugInMonitor {
    Fixed gamma, redX, redY, greenX, greenY, blueX, blueY, whiteX, whiteY, ambient;
};

/// What the record's platformData points at: the host's window.
struct PlatformData {
    void* hostWindow;
};

using AbortProc = Boolean (*)();
using ProgressProc = void (*)(std::int32_t done, std::int32_t total);
using AdvanceStateProc = std::int16_t (*)();

/// A host allocates at least 1 KiB for it, zeroed; the module neither copies it nor relies on its size.
struct FilterRecord {
    std::int32_t serialNumber; ///< 0 in modern hosts
    AbortProc abortProc;       ///< true: the user asks to stop
    ProgressProc progressProc;
    void* parameters;         ///< handle kept by the module
    Point imageSize;          ///< h = width, v = height
    std::int16_t planes;      ///< number of channels
    Rect filterRect;          ///< area to filter
    RGBColor background;      ///< old 16-bit form
    RGBColor foreground;      ///< old 16-bit form
    std::int32_t maxSpace;    ///< host: bytes available
    std::int32_t bufferSpace; ///< module: bytes wanted (prepare)
    Rect inRect;              ///< input request
    std::int16_t inLoPlane;   ///< first input plane
    std::int16_t inHiPlane;   ///< last input plane
    Rect outRect;             ///< output request
    std::int16_t outLoPlane;  ///< first output plane
    std::int16_t outHiPlane;  ///< last output plane
    void* inData;             ///< input buffer
    std::int32_t inRowBytes;  ///< input stride
    void* outData;            ///< output buffer
    std::int32_t outRowBytes; ///< output stride
    Boolean isFloating;
    Boolean haveMask; ///< selection is not a rectangle
    Boolean autoMask; ///< host masks the output
    Rect maskRect;    ///< mask request
    void* maskData;   ///< 1 byte per pixel
    std::int32_t maskRowBytes;
    FilterColor backColor;  ///< 4 bytes, native colour space
    FilterColor foreColor;  ///< 4 bytes
    std::uint32_t hostSig;  ///< four-char code of the host
    void* hostProc;         ///< (i16 selector, pointer-size*)
    std::int16_t imageMode; ///< an ImageMode
    Fixed imageHRes;        ///< 16.16 dpi
    Fixed imageVRes;        ///< 16.16 dpi
    Point floatCoord;
    Point wholeSize;
    PlugInMonitor monitor;
    PlatformData* platformData; ///< Windows: pointer to PlatformData
    void* bufferProcs;
    void* resourceProcs;
    void* processEvent; ///< callback(void*)
    void* displayPixels;
    void* handleProcs;
    Boolean supportsDummyChannels;
    Boolean supportsAlternateLayouts;
    std::int16_t wantLayout;      ///< 0 = traditional (interleaved)
    std::int16_t filterCase;      ///< 1 to 7; 1: flat picture, no selection
    std::int16_t dummyPlaneValue; ///< -1 = undefined
    void* premiereHook;
    AdvanceStateProc advanceState; ///< makes the requested buffers current
    Boolean supportsAbsolute;
    Boolean wantsAbsolute;
    void* getPropertyObsolete;
    Boolean cannotUndo;
    Boolean supportsPadding;
    std::int16_t inputPadding; ///< -3 = error on out of bounds (default)
    std::int16_t outputPadding;
    std::int16_t maskPadding;
    std::int8_t samplingSupport;
    std::int8_t reservedByte;
    Fixed inputRate; ///< 16.16, 1.0 = 0x10000
    Fixed maskRate;  ///< 16.16
    void* colorServices;
    std::int16_t inLayerPlanes;
    std::int16_t inTransparencyMask;
    std::int16_t inLayerMasks;
    std::int16_t inInvertedLayerMasks;
    std::int16_t inNonLayerPlanes;
    std::int16_t outLayerPlanes;
    std::int16_t outTransparencyMask;
    std::int16_t outLayerMasks;
    std::int16_t outInvertedLayerMasks;
    std::int16_t outNonLayerPlanes;
    std::int16_t absLayerPlanes;
    std::int16_t absTransparencyMask;
    std::int16_t absLayerMasks;
    std::int16_t absInvertedLayerMasks;
    std::int16_t absNonLayerPlanes;
    std::int16_t inPreDummyPlanes;
    std::int16_t inPostDummyPlanes;
    std::int16_t outPreDummyPlanes;
    std::int16_t outPostDummyPlanes;
    std::int32_t inColumnBytes; ///< 0 = host did not set it
    std::int32_t inPlaneBytes;  ///< 0 = host did not set it
    std::int32_t outColumnBytes;
    std::int32_t outPlaneBytes;
    void* imageServicesProcs;
    void* propertyProcs;
    std::int16_t inTileHeight;
    std::int16_t inTileWidth;
    Point inTileOrigin;
    std::int16_t absTileHeight;
    std::int16_t absTileWidth;
    Point absTileOrigin;
    std::int16_t outTileHeight;
    std::int16_t outTileWidth;
    Point outTileOrigin;
    std::int16_t maskTileHeight;
    std::int16_t maskTileWidth;
    Point maskTileOrigin;
    void* descriptorParameters;
    std::uint8_t* errorString; ///< pointer to 256-byte Pascal string
    void* channelPortProcs;
    void* documentInfo;
    void* sSPBasic;
    void* plugInRef;
    std::int32_t depth;   ///< bits per channel 8/16(/32)
    void* iCCprofileData; ///< Handle
    std::int32_t iCCprofileSize;
    std::int32_t canUseICCProfiles;
    std::int32_t hasImageScrap;
    void* bigDocumentData; ///< 32-bit coordinates; null = not offered
    void* input3DScene;
    void* output3DScene;
    Boolean createNewLayer;
    void* iCCWorkingProfileData;
    std::int32_t iCCWorkingProfileSize;
};

#pragma pack(pop)

/// What the about selector receives instead of a filter record.
struct AboutRecord {
    PlatformData* platformData;
    void* sSPBasic;
    void* plugInRef;
    char reserved[244];
};

/// Selectors of the entry point.
enum Selector : std::int16_t {
    SelectorAbout = 0,
    SelectorParameters = 1,
    SelectorPrepare = 2,
    SelectorStart = 3,
    SelectorContinue = 4,
    SelectorFinish = 5,
};

/// Values of the result cell.
enum ResultCode : std::int16_t {
    NoErr = 0,
    ParamErr = -50,
    MemFullErr = -108,
    UserCanceledErr = -128,
    FilterBadParameters = -30100,
};

/// Values of imageMode.
enum ImageMode : std::int16_t {
    ModeGrayScale = 1,
    ModeRGB = 3,
    ModeCMYK = 4,
    ModeLab = 9,
    ModeGray16 = 10,
    ModeRGB48 = 11,
    ModeLab48 = 12,
    ModeCMYK64 = 13,
};

// The layout is the host's: each field is checked for 32-bit and 64-bit pointers.
constexpr std::size_t offsetHere(std::size_t on32, std::size_t on64) {
    return sizeof(void*) == 4 ? on32 : on64;
}
#define ORVELA_CHECK_OFFSET(field, on32, on64)                                                               \
    static_assert(offsetof(FilterRecord, field) == offsetHere(on32, on64))
ORVELA_CHECK_OFFSET(serialNumber, 0, 0);
ORVELA_CHECK_OFFSET(abortProc, 4, 4);
ORVELA_CHECK_OFFSET(progressProc, 8, 12);
ORVELA_CHECK_OFFSET(parameters, 12, 20);
ORVELA_CHECK_OFFSET(imageSize, 16, 28);
ORVELA_CHECK_OFFSET(planes, 20, 32);
ORVELA_CHECK_OFFSET(filterRect, 22, 34);
ORVELA_CHECK_OFFSET(background, 30, 42);
ORVELA_CHECK_OFFSET(foreground, 36, 48);
ORVELA_CHECK_OFFSET(maxSpace, 44, 56);
ORVELA_CHECK_OFFSET(bufferSpace, 48, 60);
ORVELA_CHECK_OFFSET(inRect, 52, 64);
ORVELA_CHECK_OFFSET(inLoPlane, 60, 72);
ORVELA_CHECK_OFFSET(inHiPlane, 62, 74);
ORVELA_CHECK_OFFSET(outRect, 64, 76);
ORVELA_CHECK_OFFSET(outLoPlane, 72, 84);
ORVELA_CHECK_OFFSET(outHiPlane, 74, 86);
ORVELA_CHECK_OFFSET(inData, 76, 88);
ORVELA_CHECK_OFFSET(inRowBytes, 80, 96);
ORVELA_CHECK_OFFSET(outData, 84, 100);
ORVELA_CHECK_OFFSET(outRowBytes, 88, 108);
ORVELA_CHECK_OFFSET(isFloating, 92, 112);
ORVELA_CHECK_OFFSET(haveMask, 93, 113);
ORVELA_CHECK_OFFSET(autoMask, 94, 114);
ORVELA_CHECK_OFFSET(maskRect, 96, 116);
ORVELA_CHECK_OFFSET(maskData, 104, 124);
ORVELA_CHECK_OFFSET(maskRowBytes, 108, 132);
ORVELA_CHECK_OFFSET(backColor, 112, 136);
ORVELA_CHECK_OFFSET(foreColor, 116, 140);
ORVELA_CHECK_OFFSET(hostSig, 120, 144);
ORVELA_CHECK_OFFSET(hostProc, 124, 148);
ORVELA_CHECK_OFFSET(imageMode, 128, 156);
ORVELA_CHECK_OFFSET(imageHRes, 132, 160);
ORVELA_CHECK_OFFSET(imageVRes, 136, 164);
ORVELA_CHECK_OFFSET(floatCoord, 140, 168);
ORVELA_CHECK_OFFSET(wholeSize, 144, 172);
ORVELA_CHECK_OFFSET(monitor, 148, 176);
ORVELA_CHECK_OFFSET(platformData, 188, 216);
ORVELA_CHECK_OFFSET(bufferProcs, 192, 224);
ORVELA_CHECK_OFFSET(resourceProcs, 196, 232);
ORVELA_CHECK_OFFSET(processEvent, 200, 240);
ORVELA_CHECK_OFFSET(displayPixels, 204, 248);
ORVELA_CHECK_OFFSET(handleProcs, 208, 256);
ORVELA_CHECK_OFFSET(supportsDummyChannels, 212, 264);
ORVELA_CHECK_OFFSET(supportsAlternateLayouts, 213, 265);
ORVELA_CHECK_OFFSET(wantLayout, 214, 266);
ORVELA_CHECK_OFFSET(filterCase, 216, 268);
ORVELA_CHECK_OFFSET(dummyPlaneValue, 218, 270);
ORVELA_CHECK_OFFSET(premiereHook, 220, 272);
ORVELA_CHECK_OFFSET(advanceState, 224, 280);
ORVELA_CHECK_OFFSET(supportsAbsolute, 228, 288);
ORVELA_CHECK_OFFSET(wantsAbsolute, 229, 289);
ORVELA_CHECK_OFFSET(getPropertyObsolete, 232, 292);
ORVELA_CHECK_OFFSET(cannotUndo, 236, 300);
ORVELA_CHECK_OFFSET(supportsPadding, 237, 301);
ORVELA_CHECK_OFFSET(inputPadding, 238, 302);
ORVELA_CHECK_OFFSET(outputPadding, 240, 304);
ORVELA_CHECK_OFFSET(maskPadding, 242, 306);
ORVELA_CHECK_OFFSET(samplingSupport, 244, 308);
ORVELA_CHECK_OFFSET(reservedByte, 245, 309);
ORVELA_CHECK_OFFSET(inputRate, 248, 312);
ORVELA_CHECK_OFFSET(maskRate, 252, 316);
ORVELA_CHECK_OFFSET(colorServices, 256, 320);
ORVELA_CHECK_OFFSET(inLayerPlanes, 260, 328);
ORVELA_CHECK_OFFSET(inTransparencyMask, 262, 330);
ORVELA_CHECK_OFFSET(inLayerMasks, 264, 332);
ORVELA_CHECK_OFFSET(inInvertedLayerMasks, 266, 334);
ORVELA_CHECK_OFFSET(inNonLayerPlanes, 268, 336);
ORVELA_CHECK_OFFSET(outLayerPlanes, 270, 338);
ORVELA_CHECK_OFFSET(outTransparencyMask, 272, 340);
ORVELA_CHECK_OFFSET(outLayerMasks, 274, 342);
ORVELA_CHECK_OFFSET(outInvertedLayerMasks, 276, 344);
ORVELA_CHECK_OFFSET(outNonLayerPlanes, 278, 346);
ORVELA_CHECK_OFFSET(absLayerPlanes, 280, 348);
ORVELA_CHECK_OFFSET(absTransparencyMask, 282, 350);
ORVELA_CHECK_OFFSET(absLayerMasks, 284, 352);
ORVELA_CHECK_OFFSET(absInvertedLayerMasks, 286, 354);
ORVELA_CHECK_OFFSET(absNonLayerPlanes, 288, 356);
ORVELA_CHECK_OFFSET(inPreDummyPlanes, 290, 358);
ORVELA_CHECK_OFFSET(inPostDummyPlanes, 292, 360);
ORVELA_CHECK_OFFSET(outPreDummyPlanes, 294, 362);
ORVELA_CHECK_OFFSET(outPostDummyPlanes, 296, 364);
ORVELA_CHECK_OFFSET(inColumnBytes, 300, 368);
ORVELA_CHECK_OFFSET(inPlaneBytes, 304, 372);
ORVELA_CHECK_OFFSET(outColumnBytes, 308, 376);
ORVELA_CHECK_OFFSET(outPlaneBytes, 312, 380);
ORVELA_CHECK_OFFSET(imageServicesProcs, 316, 384);
ORVELA_CHECK_OFFSET(propertyProcs, 320, 392);
ORVELA_CHECK_OFFSET(inTileHeight, 324, 400);
ORVELA_CHECK_OFFSET(inTileWidth, 326, 402);
ORVELA_CHECK_OFFSET(inTileOrigin, 328, 404);
ORVELA_CHECK_OFFSET(absTileHeight, 332, 408);
ORVELA_CHECK_OFFSET(absTileWidth, 334, 410);
ORVELA_CHECK_OFFSET(absTileOrigin, 336, 412);
ORVELA_CHECK_OFFSET(outTileHeight, 340, 416);
ORVELA_CHECK_OFFSET(outTileWidth, 342, 418);
ORVELA_CHECK_OFFSET(outTileOrigin, 344, 420);
ORVELA_CHECK_OFFSET(maskTileHeight, 348, 424);
ORVELA_CHECK_OFFSET(maskTileWidth, 350, 426);
ORVELA_CHECK_OFFSET(maskTileOrigin, 352, 428);
ORVELA_CHECK_OFFSET(descriptorParameters, 356, 432);
ORVELA_CHECK_OFFSET(errorString, 360, 440);
ORVELA_CHECK_OFFSET(channelPortProcs, 364, 448);
ORVELA_CHECK_OFFSET(documentInfo, 368, 456);
ORVELA_CHECK_OFFSET(sSPBasic, 372, 464);
ORVELA_CHECK_OFFSET(plugInRef, 376, 472);
ORVELA_CHECK_OFFSET(depth, 380, 480);
ORVELA_CHECK_OFFSET(iCCprofileData, 384, 484);
ORVELA_CHECK_OFFSET(iCCprofileSize, 388, 492);
ORVELA_CHECK_OFFSET(canUseICCProfiles, 392, 496);
ORVELA_CHECK_OFFSET(hasImageScrap, 396, 500);
ORVELA_CHECK_OFFSET(bigDocumentData, 400, 504);
ORVELA_CHECK_OFFSET(input3DScene, 404, 512);
ORVELA_CHECK_OFFSET(output3DScene, 408, 520);
ORVELA_CHECK_OFFSET(createNewLayer, 412, 528);
ORVELA_CHECK_OFFSET(iCCWorkingProfileData, 416, 532);
ORVELA_CHECK_OFFSET(iCCWorkingProfileSize, 420, 540);
#undef ORVELA_CHECK_OFFSET

static_assert(sizeof(Point) == 4 && sizeof(Rect) == 8 && sizeof(PlugInMonitor) == 40);
static_assert(sizeof(AboutRecord) == (sizeof(void*) == 4 ? 256 : 272));

} // namespace host

} // namespace orvela
