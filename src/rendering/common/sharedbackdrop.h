#pragma once

#include <QtPlugin>

class QQuickItem;

// A backdrop that several items show and that works only while one of them is visible
// (a capture shared by overlays). Items that show a backdrop tell it when they start and
// stop using it, without knowing what kind of backdrop it is.
class SharedBackdrop
{
public:
    virtual ~SharedBackdrop() = default;

    virtual void addUser(QQuickItem *user) = 0;
    virtual void removeUser(QQuickItem *user) = 0;
};

#define SharedBackdrop_iid "org.quorvaneos.pelkan.SharedBackdrop"
Q_DECLARE_INTERFACE(SharedBackdrop, SharedBackdrop_iid)
