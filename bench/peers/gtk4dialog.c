// GTK 4's color chooser dialog as a program of its own.

#include <gtk/gtk.h>

static void leave(GtkDialog *dialog, int response, gpointer loop)
{
    (void)dialog;
    (void)response;
    g_main_loop_quit(loop);
}

int main(void)
{
    gtk_init();
    GMainLoop *loop = g_main_loop_new(NULL, FALSE);
    GtkWidget *dialog = gtk_color_chooser_dialog_new("Color", NULL);
    g_signal_connect(dialog, "response", G_CALLBACK(leave), loop);
    gtk_window_present(GTK_WINDOW(dialog));
    g_main_loop_run(loop);
    return 0;
}
