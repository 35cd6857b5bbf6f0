#include "mainwindow/Form1.h"
#include "platform/events.h"

int main() {
  Form1 janelaPrincipal;
  if (!janelaPrincipal.Form_Load()) return 0;
  janelaPrincipal.Show();
  platform::RunEventLoop();
  return 0;
}
