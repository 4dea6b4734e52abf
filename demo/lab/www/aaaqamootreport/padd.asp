<?php
// The lab's order report: the summary of an order that has arrived. Values are in Windows-1255, as they came.
header('Content-Type: text/plain; charset=windows-1255');
$fields = [];
foreach (['k1', 't1', 't2', 't3', 't4', 't5', 't8'] as $key) {
    $fields[] = $key . '=' . ($_GET[$key] ?? '');
}
file_put_contents($_SERVER['LAB_FOLDER'] . '/reports.log', 'REPORT ' . implode(' | ', $fields) . "\n", FILE_APPEND | LOCK_EX);
echo "OK\r\n";
