<?php
// The lab's done call: the sender has finished with the client's order.
header('Content-Type: text/plain; charset=windows-1255');
file_put_contents(
    $_SERVER['LAB_FOLDER'] . '/reports.log',
    'DONE t1=' . ($_GET['t1'] ?? '') . ' | t2=' . ($_GET['t2'] ?? '') . "\n",
    FILE_APPEND | LOCK_EX
);
echo "OK\r\n";
