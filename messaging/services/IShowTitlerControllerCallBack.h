// Answers of the service ShowTitlerController, implemented by its client. Called in the GUI thread.
#pragma once

class IShowTitlerControllerCallBack
{
public:
    virtual ~IShowTitlerControllerCallBack() = default;

    virtual void showTitler() = 0;
};
