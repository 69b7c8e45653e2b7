#include "CompressedFaces.h"

#include <gtest/gtest.h>

#include <thread>
#include <vector>

namespace
{

using kareport::CompressedFaces;

TEST(CompressedFaces, AreFoundByTheirContent)
{
    CompressedFaces faces;
    EXPECT_TRUE(faces.find("a face").isEmpty()) << "before anything is kept";
    faces.keep("a face", "x");
    faces.keep("a fact", "y");
    EXPECT_EQ(faces.find("a face"), "x");
    EXPECT_EQ(faces.find("a fact"), "y");
    EXPECT_TRUE(faces.find("a fac").isEmpty());
    EXPECT_TRUE(faces.find("").isEmpty());
    EXPECT_EQ(faces.size(), 14);
    faces.keep("a face", "x");
    EXPECT_EQ(faces.size(), 14) << "as when two threads compress the same one";
}

TEST(CompressedFaces, WhatWasUsedLastIsKept)
{
    const auto face = [](char letter) { return QByteArray(CompressedFaces::mostBytes / 4 - 1, letter); };
    CompressedFaces faces;
    for (const char letter : {'a', 'b', 'c', 'd'}) {
        faces.keep(face(letter), "x");
    }
    EXPECT_EQ(faces.size(), CompressedFaces::mostBytes);
    EXPECT_FALSE(faces.find(face('a')).isEmpty());
    faces.keep(face('e'), "x");
    EXPECT_EQ(faces.size(), CompressedFaces::mostBytes);
    for (const char letter : {'a', 'c', 'd', 'e'}) {
        EXPECT_FALSE(faces.find(face(letter)).isEmpty()) << letter;
    }
    EXPECT_TRUE(faces.find(face('b')).isEmpty()) << "the one that was used least recently";
    faces.keep(QByteArray(CompressedFaces::mostBytes, 'f'), "x");
    EXPECT_TRUE(faces.find(QByteArray(CompressedFaces::mostBytes, 'f')).isEmpty()) << "too large for all";
    EXPECT_EQ(faces.size(), CompressedFaces::mostBytes) << "which takes nothing away";
}

TEST(CompressedFaces, AreSharedByThreads)
{
    CompressedFaces faces;
    const auto work = [&faces](int thread) {
        for (int i = 0; i < 200; ++i) {
            const QByteArray face = QByteArray::number(i % 20);
            const QByteArray found = faces.find(face);
            EXPECT_TRUE(found.isEmpty() || found == face + '!') << thread;
            if (found.isEmpty()) {
                faces.keep(face, face + '!');
            }
        }
    };
    std::vector<std::thread> threads;
    for (int thread = 0; thread < 4; ++thread) {
        threads.emplace_back(work, thread);
    }
    for (std::thread &thread : threads) {
        thread.join();
    }
    EXPECT_EQ(faces.find("7"), "7!");
}

} // namespace
