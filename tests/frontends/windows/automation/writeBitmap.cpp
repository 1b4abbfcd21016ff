#include "writeBitmap.h"

#include <cstdlib>
#include <fstream>
#include <vector>

void writeBitmap(HDC device, const RECT& place, const std::string& name) {
    const char* const folder = std::getenv("ZANDOR_PICTURES");
    if (!folder) return;
    const int width = place.right - place.left;
    const int height = place.bottom - place.top;
    const HDC memory = CreateCompatibleDC(device);
    const HBITMAP copy = CreateCompatibleBitmap(device, width, height);
    const HGDIOBJ before = SelectObject(memory, copy);
    BitBlt(memory, 0, 0, width, height, device, place.left, place.top, SRCCOPY);
    SelectObject(memory, before);
    BITMAPINFO info{};
    info.bmiHeader.biSize = sizeof info.bmiHeader;
    info.bmiHeader.biWidth = width;
    info.bmiHeader.biHeight = height;
    info.bmiHeader.biPlanes = 1;
    info.bmiHeader.biBitCount = 32;
    std::vector<char> points(static_cast<std::size_t>(width * height * 4));
    GetDIBits(memory, copy, 0, static_cast<UINT>(height), points.data(), &info, DIB_RGB_COLORS);
    DeleteObject(copy);
    DeleteDC(memory);
    BITMAPFILEHEADER header{};
    header.bfType = 0x4D42; // "BM"
    header.bfOffBits = sizeof header + sizeof info.bmiHeader;
    header.bfSize = header.bfOffBits + static_cast<DWORD>(points.size());
    std::ofstream file(std::string(folder) + '/' + name + ".bmp", std::ios::binary);
    file.write(reinterpret_cast<const char*>(&header), sizeof header);
    file.write(reinterpret_cast<const char*>(&info.bmiHeader), sizeof info.bmiHeader);
    file.write(points.data(), static_cast<std::streamsize>(points.size()));
}
